#include "LogGenerator/CellMonitor.h"

#include "LogGenerator/support/CellRecord.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"
#include "support/Recording.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <limits>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr CellRow kRows[] = {
    cellRow("Level", "Shown Level", "no level\n", decibels),
    cellRow("Channel", "Uplink", "no channel\n"),
    cellRow("Channel", "Downlink", nullptr),
};

bool isWanted(const PropertyValue& cell)
{
    return isCell(cell, kTSCellMonitorRadioAccessTechnologyGSM, kTSCellMonitorCellTypeServing);
}

constexpr CellLayout kLayout = {isWanted, kRows};

PropertyValue cellWith(const PropertyValue& level)
{
    return PropertyValue::dictionaryOf({
        {"Level", level}
    });
}

class CellMonitorTest : public ::testing::Test
{
protected:
    TestServices services;
    PropertyValue rows = PropertyValue::newDictionary();
};

} // namespace

TEST_F(CellMonitorTest, FindsTheArrayBehindTheHeader)
{
    const Bytes record = cellRecord({servingGsm(), "text"});
    const auto cells = cellArray(PacketView(record));
    ASSERT_TRUE(cells);
    EXPECT_EQ(cells->size(), 2U);
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST_F(CellMonitorTest, ARecordThatCannotBeParsedIsReported)
{
    for (std::size_t size = 0; size <= 13; ++size)
        EXPECT_EQ(cellArray(PacketView(Bytes(size, 0))), nullptr);
    const Bytes nonsense = PacketBuilder::withText(kCellRecord, "nonsense");
    EXPECT_EQ(cellArray(PacketView(nonsense)), nullptr);
    EXPECT_EQ(services.log.count("Cell Info Array data could not be constructed"), 15U);
    EXPECT_EQ(services.log.errors().size(), 15U);
}

TEST_F(CellMonitorTest, ARootThatIsNoArrayCountsAsNoneSilently)
{
    const Bytes record =
        PacketBuilder::withPropertyList(kCellRecord, PropertyValue::newDictionary());
    EXPECT_EQ(cellArray(PacketView(record)), nullptr);
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST_F(CellMonitorTest, ANumberTooLargeCostsNoCell)
{
    const PropertyValue cell = servingGsm();
    cell.asDictionary()->set("Unread", PropertyValue::largeNumber({"18446744073709551616"}));
    cell.asDictionary()->set("Level", PropertyValue::largeNumber({"1e400", true}));
    const Bytes record = cellRecord({cell, servingUmts()});
    const auto cells = cellArray(PacketView(record));
    ASSERT_TRUE(cells);
    EXPECT_EQ(cells->size(), 2U);
    EXPECT_THAT(services.log.lines, IsEmpty());
    EXPECT_EQ(cellNumber((*cells)[0], "Level"), std::nullopt);
}

TEST_F(CellMonitorTest, ACellIsKnownByItsTechnologyAndType)
{
    const char* gsm = kTSCellMonitorRadioAccessTechnologyGSM;
    const char* serving = kTSCellMonitorCellTypeServing;
    EXPECT_TRUE(isCell(servingGsm(), gsm, serving));
    EXPECT_FALSE(isCell(servingUmts(), gsm, serving));
    EXPECT_FALSE(isCell(neighbouringGsm(), gsm, serving));
    EXPECT_FALSE(isCell("text", gsm, serving));
    EXPECT_FALSE(isCell(PropertyValue(), gsm, serving));
    for (const char* key : {kTSCellMonitorCellRadioAccessTechnology, kTSCellMonitorCellType}) {
        const PropertyValue lacking = servingGsm();
        lacking.asDictionary()->remove(key);
        EXPECT_FALSE(isCell(lacking, gsm, serving)) << key;
        const PropertyValue odd = servingGsm();
        odd.asDictionary()->set(key, PropertyValue::integer(1));
        EXPECT_FALSE(isCell(odd, gsm, serving)) << key;
    }
}

TEST_F(CellMonitorTest, ANumberIsWholeAndWithin32SignedBits)
{
    const std::pair<PropertyValue, std::int32_t> kNumbers[] = {
        {PropertyValue::integer(0),           0              },
        {PropertyValue::integer(2147483647),  2147483647     },
        {PropertyValue::integer(-2147483648), -2147483648    },
        {PropertyValue::real(-50.0),          -50            },
        {PropertyValue::real(-0.0),           0              },
        {PropertyValue::real(2147483647.0),   2147483647     },
        {PropertyValue::real(-2147483648.0),  -2147483647 - 1},
    };
    for (const auto& [value, number] : kNumbers)
        EXPECT_EQ(cellNumber(cellWith(value), "Level"), number) << value.description();
}

TEST_F(CellMonitorTest, AnythingElseIsNoNumber)
{
    const PropertyValue kOthers[] = {
        PropertyValue::integer(2147483648),
        PropertyValue::integer(-2147483649),
        PropertyValue::integer(std::numeric_limits<std::int64_t>::min()),
        PropertyValue::real(0.5),
        PropertyValue::real(2147483648.0),
        PropertyValue::real(-2147483649.0),
        PropertyValue::real(1e300),
        PropertyValue::real(std::numeric_limits<double>::quiet_NaN()),
        PropertyValue::real(std::numeric_limits<double>::infinity()),
        PropertyValue::real(-std::numeric_limits<double>::infinity()),
        PropertyValue::boolean(true),
        PropertyValue("12"),
        PropertyValue::data({1}),
        PropertyValue::date({1}),
        PropertyValue::newArray(),
        PropertyValue::newDictionary(),
    };
    for (const PropertyValue& value : kOthers)
        EXPECT_EQ(cellNumber(cellWith(value), "Level"), std::nullopt) << value.description();
    EXPECT_EQ(cellNumber(cellWith("12"), "Channel"), std::nullopt);
    EXPECT_EQ(cellNumber(PropertyValue(), "Level"), std::nullopt);
}

TEST_F(CellMonitorTest, ACellsRowsAreWrittenInTheTablesOrder)
{
    writeCellRows(rows.asDictionary(),
                  servingGsm({
                      {"Channel", 17},
                      {"Level",   -3}
    }),
                  kRows);
    EXPECT_EQ(rows.description(), "{Shown Level = -3 dB; Uplink = 17; Downlink = 17}");
}

TEST_F(CellMonitorTest, AMissingNumberIsReportedUnlessItsRowHasNoTextForThat)
{
    setRow(rows.asDictionary(), "Uplink", "earlier");
    writeCellRows(rows.asDictionary(), servingGsm(), kRows);
    EXPECT_THAT(services.log.errors(), ElementsAre("no level\n", "no channel\n"));
    EXPECT_EQ(rows.description(), "{Uplink = earlier}");
}

TEST_F(CellMonitorTest, WithoutRowsNothingIsWritten)
{
    writeCellRows(nullptr,
                  servingGsm({
                      {"Level", 1}
    }),
                  kRows);
    const Bytes record = cellRecord({
        servingGsm({{"Level", 1}}
        )
    });
    writeFirstCell(nullptr, PacketView(record), kLayout);
}

TEST_F(CellMonitorTest, OnlyTheFirstWantedCellIsWritten)
{
    const Bytes record = cellRecord({
        neighbouringGsm({{"Channel", 1}}
        ), servingGsm({ {"Channel", 2},  {"Level", 2}}
        ),
        servingGsm({ {"Channel", 3},  {"Level", 3}}
        )
    });
    writeFirstCell(rows.asDictionary(), PacketView(record), kLayout);
    EXPECT_EQ(rows["Uplink"], PropertyValue("2"));
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST_F(CellMonitorTest, EachWantedCellBecomesADictionaryEvenIfEmpty)
{
    const Bytes record = cellRecord({
        servingGsm({{"Channel", 2}}
        ), neighbouringGsm(), servingGsm()
    });
    ListElements elements;
    addCells(elements, PacketView(record), kLayout);
    const std::vector<PropertyValue> dictionaries = elements.take();
    ASSERT_EQ(dictionaries.size(), 2U);
    EXPECT_EQ(dictionaries[0].description(), "{Uplink = 2; Downlink = 2}");
    EXPECT_EQ(dictionaries[1].description(), "{}");
}

TEST_F(CellMonitorTest, ARecordWithoutAnArrayOfCellsIsReported)
{
    const Bytes dictionary =
        PacketBuilder::withPropertyList(kCellRecord, PropertyValue::newDictionary());
    writeFirstCell(rows.asDictionary(), PacketView(dictionary), kLayout);
    EXPECT_THAT(services.log.errors(), ElementsAre("Failed to get Cell Array\n"));
    services.log.lines.clear();
    const Bytes nonsense = PacketBuilder::withText(kCellRecord, "nonsense");
    ListElements elements;
    addCells(elements, PacketView(nonsense), kLayout);
    EXPECT_THAT(elements.take(), IsEmpty());
    EXPECT_THAT(services.log.errors(), ElementsAre("Cell Info Array data could not be constructed",
                                                   "Failed to get Cell Array\n"));
}

} // namespace orvane
