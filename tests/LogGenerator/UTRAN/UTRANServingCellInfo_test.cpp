#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/support/CellRecord.h"
#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kCode = 0xD0E2;

using UTRANServingCellInfoTest = SectionTest<UTRANServingCellInfo>;

PacketBuilder packet()
{
    PacketBuilder builder(kCode, 26);
    return builder.put8(14, 255)
        .put8(15, 7)
        .put8(16, 99)
        .put16(17, 65535)
        .put16(19, 10588)
        .put32(21, 0x01A2B303)
        .put8(25, 1);
}

// A serving cell whose numbers are `first` and the ones that follow it.
PropertyValue servingCell(std::int64_t first)
{
    return cellOf(kTSCellMonitorRadioAccessTechnologyUTRAN2, kTSCellMonitorCellTypeServing,
                  {
                      {kTSCellMonitorLAC,      first    },
                      {kTSCellMonitorCellId,   first + 1},
                      {kTSCellMonitorBandInfo, first + 2},
                      {kTSCellMonitorSCN,      first + 3},
                      {kTSCellMonitorUARFCN,   first + 4}
    });
}

} // namespace

TEST_F(UTRANServingCellInfoTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "Serving Cell Info");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode, kCellRecord));
}

TEST_F(UTRANServingCellInfoTest, FillsItsRowsInOrderAndLogsTheCall)
{
    send(kCode, packet());
    EXPECT_EQ(rows(), (Rows{
                          {"Cell Access Restrictions", "255"                 },
                          {"Cell ID",                  "27439875"            },
                          {"Downlink UARFCN",          "10588"               },
                          {"Uplink UARFCN",            "65535"               },
                          {"URA ID",                   "7"                   },
                          {"Allowed Access",           "Emergency Calls Only"},
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "Serving Cell Info"}));
}

TEST_F(UTRANServingCellInfoTest, OnlyTheLowestBitBarsNormalCalls)
{
    for (std::uint32_t byte = 0; byte < 256; ++byte) {
        send(kCode, packet().put8(25, byte));
        EXPECT_EQ(row("Allowed Access"), byte % 2 == 1 ? "Emergency Calls Only" : "All Calls")
            << byte;
    }
}

TEST_F(UTRANServingCellInfoTest, ACellIdBeyondTheSignedRangeShowsAsCShowsIt)
{
    send(kCode, packet().put32(21, 0xFFFFFFFF));
    EXPECT_EQ(row("Cell ID"), "-1");
}

TEST_F(UTRANServingCellInfoTest, ShorterPacketsChangeNothing)
{
    send(kCode, PacketBuilder(kCode, 26));
    expectShorterIsIgnored(kCode, packet(), 26);
}

TEST_F(UTRANServingCellInfoTest, CellsFillTheRowsOfTheServingCell)
{
    send(kCellRecord, cellRecord({servingCell(10)}));
    EXPECT_EQ(rows(), (Rows{
                          {"Local Area Code",      "10"},
                          {"Cell ID",              "11"},
                          {"Freq Band Indicator",  "12"},
                          {"Cell Scrambling Code", "13"},
                          {"Uplink UARFCN",        "14"},
                          {"Downlink UARFCN",      "14"},
    }));
}

TEST_F(UTRANServingCellInfoTest, TheLastServingCellWins)
{
    send(kCellRecord, cellRecord({servingCell(10), "text", servingCell(20)}));
    EXPECT_EQ(row("Local Area Code"), "20");
    EXPECT_EQ(row("Downlink UARFCN"), "24");
}

TEST_F(UTRANServingCellInfoTest, WhatTheLastServingCellLacksStaysAsTheFirstOneSaid)
{
    const PropertyValue bare =
        cellOf(kTSCellMonitorRadioAccessTechnologyUTRAN2, kTSCellMonitorCellTypeServing,
               {
                   {kTSCellMonitorLAC, 99}
    });
    send(kCellRecord, cellRecord({servingCell(10), bare}));
    EXPECT_EQ(row("Local Area Code"), "99");
    EXPECT_EQ(row("Cell ID"), "11");
}

TEST_F(UTRANServingCellInfoTest, ThePacketKeepsTheRowsOfTheCells)
{
    send(kCellRecord, cellRecord({servingCell(10)}));
    send(kCode, packet());
    EXPECT_EQ(row("Cell Scrambling Code"), "13");
    EXPECT_EQ(row("Uplink UARFCN"), "65535");
}

TEST_F(UTRANServingCellInfoTest, EachMissingNumberIsLoggedOnceAndItsRowLeft)
{
    send(kCellRecord, cellRecord({servingCell(10)}));
    services.log.lines.clear();
    send(kCellRecord, cellRecord({cellOf(kTSCellMonitorRadioAccessTechnologyUTRAN2,
                                         kTSCellMonitorCellTypeServing)}));
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Serving Cell Info: Failed to retrieve LAC\n",
                            "Serving Cell Info: Failed to retrieve Cell ID\n",
                            "Serving Cell Info: Failed to retrieve Freq Band Indicator\n",
                            "Serving Cell Info: Failed to retrieve Cell Scrambling Code\n",
                            "Serving Cell Info: Failed to retrieve UARFCN\n"));
    EXPECT_EQ(row("Local Area Code"), "10");
    EXPECT_EQ(row("Uplink UARFCN"), "14");
    EXPECT_EQ(row("Downlink UARFCN"), "14");
}

TEST_F(UTRANServingCellInfoTest, OtherCellsChangeNothingAndLogNothing)
{
    const PropertyValue noType = PropertyValue::dictionaryOf({
        {kTSCellMonitorCellRadioAccessTechnology, kTSCellMonitorRadioAccessTechnologyUTRAN2}
    });
    const PropertyValue noTechnology = PropertyValue::dictionaryOf({
        {kTSCellMonitorCellType, kTSCellMonitorCellTypeServing}
    });
    send(kCellRecord, cellRecord({
                          noType, noTechnology, servingUmts(),
                          cellOf(kTSCellMonitorRadioAccessTechnologyUTRAN2,
                                 kTSCellMonitorCellTypeNeighbor, {{kTSCellMonitorLAC, 1}}
                                  )
    }));
    send(kCellRecord, cellRecord({}));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(UTRANServingCellInfoTest, CellsThatCannotBeParsedGiveOneErrorLineOnly)
{
    send(kCellRecord, PacketBuilder::withText(kCellRecord, "nonsense"));
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Cell Info Array data could not be constructed"));
}

TEST_F(UTRANServingCellInfoTest, ARootThatIsNoArrayGivesNoErrorLine)
{
    send(kCellRecord, PacketBuilder::withPropertyList(kCellRecord, PropertyValue::newDictionary()));
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(UTRANServingCellInfoTest, OtherCodesAreIgnoredSilently)
{
    send(0xD0E1, packet());
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(UTRANServingCellInfoTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kCode, packet());
    send(kCellRecord, cellRecord({servingCell(10)}));
    EXPECT_THAT(rows(), IsEmpty());
}

} // namespace orvane
