#include "LogGenerator/SharingCopier.h"

#include "platform/base/PropertyValue.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

TEST(SharingCopierTest, CopiesAreEqualAndApart)
{
    const PropertyValue original = PropertyValue::dictionaryOf({
        {"rows", PropertyValue::dictionaryOf({{"a", "1"}})               },
        {"list", PropertyValue::arrayOf({"x", PropertyValue::integer(2)})},
        {"data", PropertyValue::data({1, 2, 3})                          },
    });
    const PropertyValue copy = SharingCopier().copy(original);
    EXPECT_EQ(copy, original);
    original["rows"].asDictionary()->set("a", "2");
    original["list"].asArray()->clear();
    EXPECT_EQ(copy["rows"]["a"], PropertyValue("1"));
    EXPECT_EQ(copy["list"].asArray()->size(), 2U);
}

TEST(SharingCopierTest, WhatIsSharedIsSharedByTheCopies)
{
    const PropertyValue rows = PropertyValue::newDictionary();
    const PropertyValue list = PropertyValue::newArray();
    const PropertyValue original = PropertyValue::arrayOf({rows, list, rows});
    SharingCopier copier;
    const PropertyValue copy = copier.copy(original);
    const PropertyArray& copies = *copy.asArray();
    EXPECT_EQ(copies[0].asDictionary(), copies[2].asDictionary());
    EXPECT_NE(copies[0].asDictionary(), rows.asDictionary());
    // Also by what is copied later.
    EXPECT_EQ(copier.copy(list).asArray(), copies[1].asArray());
}

TEST(SharingCopierTest, MemoryIsCountedOnceForWhatIsShared)
{
    const PropertyValue text(std::string(10000, 'x'));
    const PropertyValue list = PropertyValue::arrayOf({text});
    SharingCopier once;
    once.copy(list);
    EXPECT_GE(once.bytes(), 10000U);
    EXPECT_LT(once.bytes(), 10500U);
    SharingCopier twice;
    twice.copy(PropertyValue::arrayOf({list, list}));
    EXPECT_LT(twice.bytes(), 11000U);
}

TEST(SharingCopierTest, AbsentAndPlainValuesAreThemselves)
{
    SharingCopier copier;
    EXPECT_FALSE(copier.copy({}));
    EXPECT_EQ(copier.copy("text"), PropertyValue("text"));
}

} // namespace
} // namespace orvane
