#include "telephonyd/StartCommand.h"

#include "platform/base/PropertyValue.h"

#include "support/Recording.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::ElementsAre;
using testing::IsEmpty;

PropertyValue number(std::int64_t value) { return PropertyValue::integer(value); }

TEST(StartCommandTest, CodesAreTakenFromBothLists)
{
    TestServices services;
    const LogSelection selection = selectionOfStartCommand(PropertyValue::dictionaryOf({
        {"SetVarnelLogCodes", PropertyValue::arrayOf({number(0xFFFF), number(0), number(0xB0C2)})},
        {"SetTsExtraCodes",   PropertyValue::arrayOf({number(2), number(2)})                     },
    }));
    EXPECT_THAT(selection.modemCodes, ElementsAre(0, 0xB0C2, 0xFFFF));
    EXPECT_THAT(selection.extraCodes, ElementsAre(2));
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST(StartCommandTest, WhatIsNoCodeIsLeftOutWithOneLineAList)
{
    TestServices services;
    const LogSelection selection = selectionOfStartCommand(PropertyValue::dictionaryOf({
        {"SetVarnelLogCodes",
         PropertyValue::arrayOf({number(-1), number(0x10000), "45250", PropertyValue::real(1),
                                 PropertyValue::boolean(true), number(7)})},
        {"SetTsExtraCodes",   number(1)                                   },
    }));
    EXPECT_THAT(selection.modemCodes, ElementsAre(7));
    EXPECT_THAT(selection.extraCodes, IsEmpty());
    EXPECT_THAT(
        services.log.errors(),
        ElementsAre("SetVarnelLogCodes of a start command holds 5 entries that are not codes",
                    "SetTsExtraCodes of a start command is of type number; no codes are taken "
                    "from it"));
}

TEST(StartCommandTest, ListsThatAreNotThereAreEmpty)
{
    TestServices services;
    const LogSelection selection = selectionOfStartCommand(PropertyValue::newDictionary());
    EXPECT_THAT(selection.modemCodes, IsEmpty());
    EXPECT_THAT(selection.extraCodes, IsEmpty());
    EXPECT_THAT(services.log.lines, IsEmpty());
}

} // namespace
} // namespace orvane
