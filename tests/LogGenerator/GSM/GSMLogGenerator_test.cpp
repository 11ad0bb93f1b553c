#include "LogGenerator/GSM/GSMLogGenerator.h"

#include "LogGenerator/InternalInconsistency.h"
#include "LogGenerator/StateKeys.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::SizeIs;

PropertyValue dictionary(const char* key, const PropertyValue& value)
{
    return PropertyValue::dictionaryOf({
        {key, value}
    });
}

PropertyValue two(const PropertyValue& a, const PropertyValue& b)
{
    return PropertyValue::dictionaryOf({
        {"a", a},
        {"b", b}
    });
}

PropertyValue simple(const PropertyValue& value) { return GSMLogGenerator::processObject(value); }

class GSMLogGeneratorTest : public ::testing::Test
{
protected:
    GSMLogGeneratorTest() { generator.init(); }
    void send(const PropertyValue& value)
    {
        const std::string text = *writeXmlPropertyList(value);
        generator.updateState(state, Bytes(text.begin(), text.end()));
    }

    TestServices services;
    PropertyDictionary state;
    GSMLogGenerator generator;
};

} // namespace

TEST_F(GSMLogGeneratorTest, AsksForStreamingAlone)
{
    EXPECT_EQ(generator.getStartCommand(), dictionary("SetState", "Streaming"));
}

TEST_F(GSMLogGeneratorTest, TheFactoryMakesIt)
{
    const auto made = LogGenerator::generatorFromTechnology(kTSLogChannelTechnology_IFX);
    EXPECT_NE(dynamic_cast<GSMLogGenerator*>(made.get()), nullptr);
}

TEST_F(GSMLogGeneratorTest, ADictionaryOfOneEntryCollapsesIntoItsValue)
{
    EXPECT_EQ(simple(dictionary("A", dictionary("B", "x"))), dictionary("A", "x"));
    EXPECT_EQ(simple(dictionary("A", two("x", "y"))), dictionary("A", two("x", "y")));
    EXPECT_EQ(simple(dictionary("A", PropertyValue::newDictionary())),
              dictionary("A", PropertyValue::newDictionary()));
}

TEST_F(GSMLogGeneratorTest, TheRootNeverCollapses)
{
    EXPECT_EQ(simple(dictionary("A", "x")), dictionary("A", "x"));
}

TEST_F(GSMLogGeneratorTest, WhatTakesADictionarysPlaceIsNotTestedAgain)
{
    // C collapses into its value within B, and B then within A: each dictionary once.
    EXPECT_EQ(simple(dictionary("A", dictionary("B", dictionary("C", "x")))), dictionary("A", "x"));
    // The array loses "first", and its one-entry dictionary collapses; the array itself stays.
    const PropertyValue array = PropertyValue::arrayOf({"first", dictionary("k", "x")});
    EXPECT_EQ(simple(dictionary("A", dictionary("B", array))),
              dictionary("A", PropertyValue::arrayOf({"x"})));
    // A value that becomes a one-entry dictionary only by its own simplification is kept.
    const PropertyValue inner = dictionary("C", two("x", "y"));
    EXPECT_EQ(simple(dictionary("A", dictionary("B", inner))), dictionary("A", two("x", "y")));
}

TEST_F(GSMLogGeneratorTest, EveryArrayLosesItsFirstElement)
{
    EXPECT_EQ(simple(PropertyValue::arrayOf({"0", "1", "2"})), PropertyValue::arrayOf({"1", "2"}));
    EXPECT_EQ(simple(PropertyValue::arrayOf({"0"})), PropertyValue::newArray());
    EXPECT_EQ(simple(PropertyValue::newArray()), PropertyValue::newArray());
    EXPECT_EQ(simple(PropertyValue::arrayOf(
                  {"0", PropertyValue::arrayOf({"a", "b"}), dictionary("k", "v")})),
              PropertyValue::arrayOf({PropertyValue::arrayOf({"b"}), "v"}));
}

TEST_F(GSMLogGeneratorTest, TheFirstElementIsDroppedUnseenWhateverItIs)
{
    EXPECT_EQ(simple(PropertyValue::arrayOf({PropertyValue::integer(1), "x"})),
              PropertyValue::arrayOf({"x"}));
}

TEST_F(GSMLogGeneratorTest, OnlyADictionaryOfOneEntryCanCollapse)
{
    EXPECT_EQ(GSMLogGenerator::canCollapse(dictionary("k", "v")), PropertyValue("v"));
    EXPECT_FALSE(GSMLogGenerator::canCollapse(two("x", "y")));
    EXPECT_FALSE(GSMLogGenerator::canCollapse(PropertyValue::newDictionary()));
    EXPECT_FALSE(GSMLogGenerator::canCollapse(PropertyValue::arrayOf({"x"})));
    EXPECT_FALSE(GSMLogGenerator::canCollapse("x"));
}

TEST_F(GSMLogGeneratorTest, AnyOtherValueIsAFailureThatNamesItsType)
{
    const std::pair<PropertyValue, const char*> kValues[] = {
        {PropertyValue::integer(1),    "number" },
        {PropertyValue::real(1),       "number" },
        {PropertyValue::boolean(true), "boolean"},
        {PropertyValue::date({}),      "date"   },
        {PropertyValue::data({1}),     "data"   },
    };
    for (const auto& [value, type] : kValues) {
        try {
            simple(dictionary("k", value));
            ADD_FAILURE() << type;
        } catch (const InternalInconsistency& failure) {
            EXPECT_EQ(failure.description(),
                      "Unknown object of type " + std::string(type) + " encountered");
            EXPECT_EQ(failure.source(), "LogGenerator/GSM/GSMLogGenerator");
            EXPECT_EQ(failure.line(), 78);
        }
    }
}

TEST_F(GSMLogGeneratorTest, AMessageThatCannotBeReadIsAFailureAndStoresNothing)
{
    try {
        const std::string text = "nonsense";
        generator.updateState(state, Bytes(text.begin(), text.end()));
        ADD_FAILURE();
    } catch (const InternalInconsistency& failure) {
        EXPECT_EQ(failure.description(), "Could not deserialize the object");
        EXPECT_EQ(failure.source(), "LogGenerator/GSM/GSMLogGenerator");
        EXPECT_EQ(failure.line(), 90);
    }
    EXPECT_TRUE(state.empty());
}

TEST_F(GSMLogGeneratorTest, AMessageReplacesTheWholeDisplay)
{
    send(two("1", "2"));
    send(dictionary("c", dictionary("d", "3")));
    EXPECT_EQ(generator.generateLogUsingState(state), dictionary("c", "3"));
    EXPECT_EQ(state[kDisplayStateKey], dictionary("c", dictionary("d", "3"))) << "as received";
    EXPECT_EQ(state[kExtraInfoKey], PropertyValue::newDictionary());
}

TEST_F(GSMLogGeneratorTest, AFailedMessageKeepsTheDisplay)
{
    send(two("1", "2"));
    EXPECT_THROW(send(dictionary("c", PropertyValue::integer(3))), InternalInconsistency);
    EXPECT_EQ(generator.generateLogUsingState(state), two("1", "2"));
}

TEST_F(GSMLogGeneratorTest, SavesItsHistoryAndNoLog)
{
    EXPECT_EQ(generator.getSaveContentsFromState(state), PropertyValue::newArray());
    send(two("1", "2"));
    generator.generateLogUsingState(state);
    generator.generateLogUsingState(state);
    const PropertyValue contents = generator.getSaveContentsFromState(state);
    ASSERT_THAT(contents.asArray()->elements(), SizeIs(2));
    EXPECT_EQ((*contents.asArray())[0]["Display"], two("1", "2"));
}

} // namespace orvane
