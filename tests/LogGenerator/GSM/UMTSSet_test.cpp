#include "LogGenerator/GSM/Sections.h"

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
using ::testing::SizeIs;

constexpr std::uint32_t kCode = 0x4005;

using UMTSSetTest = SectionTest<UMTSSet>;

Bytes twoCells(std::uint32_t count)
{
    return PacketBuilder(kCode, 15 + 20)
        .put8(13, count)
        .put16(15, 10588)
        .put16(17, 511)
        .put8(19, 0xB0)    // -80
        .put16(20, 0xFF9C) // -100
        .put8(22, 0xF9)    // -7 half decibels
        .put16(23, 0xFFF0) // -16
        .put16(25, 0xFFFF)
        .put16(27, 0xFFFF)
        .put8(29, 127)
        .put16(30, 32767)
        .put8(32, 0x80)
        .put16(33, 0x8000);
}

PropertyValue neighbour(std::int64_t power, std::int64_t energy)
{
    return neighbouringUmts({
        {kTSCellMonitorUARFCN, 10588 },
        {kTSCellMonitorSCN,    17    },
        {kTSCellMonitorRSCP,   power },
        {kTSCellMonitorECN0,   energy}
    });
}

Rows neighbourRows(const char* power, const char* energy)
{
    return {
        {"UARFCN",          "10588"},
        {"Scrambling Code", "17"   },
        {"RSCP",            power  },
        {"Energy Per Chip", energy },
    };
}

} // namespace

TEST_F(UMTSSetTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "UMTS Set");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kCode, kCellRecord));
}

TEST_F(UMTSSetTest, ShowsARecordACellInTheRowsOwnOrder)
{
    send(kCode, twoCells(1));
    EXPECT_THAT(records(), ElementsAre(Rows{
                               {"Scrambling Code",    "511"         },
                               {"RSCP",               "-101 dB"     },
                               {"Energy Per Chip",    "-3.500000 dB"},
                               {"Downlink Frequency", "10588"       },
                               {"Ranking Value",      "-16"         },
                               {"Rank Cell RSCP",     "-100 dB"     },
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "UMTSSet"}));
}

TEST_F(UMTSSetTest, RecordsBeginAtOffset15WhateverTheNumberOfGsmRecords)
{
    Bytes packet = twoCells(2);
    send(kCode, packet);
    const std::vector<Rows> withoutGsm = records();
    packet[14] = 9;
    send(kCode, packet);
    EXPECT_EQ(records(), withoutGsm);
    EXPECT_THAT(records(), SizeIs(2));
}

TEST_F(UMTSSetTest, FrequenciesShowAsSignedNumbers)
{
    send(kCode, twoCells(2));
    ASSERT_THAT(records(), SizeIs(2));
    EXPECT_EQ(records()[1], (Rows{
                                {"Scrambling Code",    "65535"        },
                                {"RSCP",               "106 dB"       },
                                {"Energy Per Chip",    "-64.000000 dB"},
                                {"Downlink Frequency", "-1"           },
                                {"Ranking Value",      "-32768"       },
                                {"Rank Cell RSCP",     "32767 dB"     },
    }));
}

TEST_F(UMTSSetTest, ACountOfZeroEmptiesTheList)
{
    send(kCode, twoCells(2));
    send(kCode, twoCells(0));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(UMTSSetTest, ACountBeyondThePacketShowsTheWholeRecords)
{
    const std::pair<std::size_t, std::size_t> kCells[] = {
        {15, 0},
        {24, 0},
        {25, 1},
        {34, 1},
        {35, 2},
    };
    for (const auto& [size, cells] : kCells) {
        sendCut(kCode, twoCells(255), size);
        EXPECT_EQ(records().size(), cells) << size;
    }
}

TEST_F(UMTSSetTest, TheLargestCountIsShownWhole)
{
    send(kCode, PacketBuilder(kCode, 15 + 255 * 10).put8(13, 255));
    EXPECT_THAT(records(), SizeIs(255));
}

TEST_F(UMTSSetTest, ShortPacketLeavesTheEarlierList)
{
    send(kCode, twoCells(2));
    expectShorterIsIgnored(kCode, twoCells(0), 15);
    EXPECT_THAT(records(), SizeIs(2));
}

TEST_F(UMTSSetTest, OtherCodesAreReported)
{
    send(kCode, twoCells(2));
    expectReported(0x417A);
}

TEST_F(UMTSSetTest, NeighboursOfTheTelephonyServerReplaceTheRankedCells)
{
    send(kCode, twoCells(2));
    send(kCellRecord, cellRecord({
                          neighbour(-95, -7),
                          neighbouringGsm({{kTSCellMonitorARFCN, 1} }
                          ),
                          servingUmts({{kTSCellMonitorUARFCN, 1}}
                          ),
                          "text",
                          neighbour(-110, 0),
    }));
    EXPECT_THAT(records(),
                ElementsAre(neighbourRows("-95 dBm", "-7 dB"), neighbourRows("-110 dBm", "0 dB")));
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(UMTSSetTest, LevelsThatWereNotMeasuredShowAsEmptyTexts)
{
    send(kCellRecord, cellRecord({neighbour(32767, 32767), neighbour(32766, -32767)}));
    EXPECT_THAT(records(),
                ElementsAre(neighbourRows("", ""), neighbourRows("32766 dBm", "-32767 dB")));
}

TEST_F(UMTSSetTest, AMissingNumberIsLoggedAndItsRowLeftOut)
{
    send(kCellRecord, cellRecord({
                          neighbouringUmts(), neighbouringUmts({{kTSCellMonitorSCN, 3}}
                           )
    }));
    EXPECT_THAT(records(), ElementsAre(
                               Rows{
    },
                               Rows{{"Scrambling Code", "3"}}));
    EXPECT_THAT(
        services.log.errors(),
        ElementsAre(
            "UMTSSet: Failed to retrieve UARFCN\n", "UMTSSet: Failed to retrieve Scrambling Code\n",
            "UMTSSet: Failed to retrieve RSCP\n", "UMTSSet: Failed to retrieve Energy Per Chip\n",
            "UMTSSet: Failed to retrieve UARFCN\n", "UMTSSet: Failed to retrieve RSCP\n",
            "UMTSSet: Failed to retrieve Energy Per Chip\n"));
}

TEST_F(UMTSSetTest, ARecordWithoutNeighboursEmptiesTheList)
{
    send(kCode, twoCells(2));
    send(kCellRecord, cellRecord({}));
    EXPECT_THAT(records(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(UMTSSetTest, ARecordWithoutCellsIsReportedAndEmptiesTheList)
{
    send(kCode, twoCells(2));
    send(kCellRecord, PacketBuilder::withText(kCellRecord, "nonsense"));
    EXPECT_THAT(records(), IsEmpty());
    EXPECT_THAT(services.log.errors(), ElementsAre("Cell Info Array data could not be constructed",
                                                   "Failed to get Cell Array\n"));
    send(kCode, twoCells(2));
    services.log.lines.clear();
    send(kCellRecord, PacketBuilder::withPropertyList(kCellRecord, PropertyValue::newDictionary()));
    EXPECT_THAT(records(), IsEmpty());
    EXPECT_THAT(services.log.errors(), ElementsAre("Failed to get Cell Array\n"));
}

} // namespace orvane
