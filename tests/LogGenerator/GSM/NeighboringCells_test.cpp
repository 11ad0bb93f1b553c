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

constexpr std::uint32_t kMeasurement = 0x5137;
constexpr std::uint32_t kBsicList = 0x51FF;

using NeighboringCellsTest = SectionTest<NeighboringCells>;

// One measured neighbour for each channel. Its level is its place in the list, C1 ten times that.
Bytes measurement(const std::vector<std::uint32_t>& channels)
{
    PacketBuilder packet(kMeasurement, 29 + 14 * channels.size());
    packet.put8(28, static_cast<std::uint32_t>(channels.size()));
    for (std::size_t i = 0; i < channels.size(); ++i) {
        const auto place = static_cast<std::uint32_t>(i);
        packet.put16(29 + 14 * i, channels[i]);
        packet.put8(29 + 14 * i + 2, place);
        packet.put32(29 + 14 * i + 3, 10 * place);
    }
    return packet;
}

Bytes bsicList(const std::vector<std::pair<std::uint32_t, std::uint32_t>>& entries)
{
    PacketBuilder packet(kBsicList, 15 + 4 * entries.size());
    packet.put8(14, static_cast<std::uint32_t>(entries.size()));
    for (std::size_t i = 0; i < entries.size(); ++i)
        packet.put16(15 + 4 * i, entries[i].first).put8(15 + 4 * i + 2, entries[i].second);
    return packet;
}

Rows neighbour(const char* channel, const char* level, const char* criterion)
{
    return {
        {"ARFCN",    channel  },
        {"RSSI",     level    },
        {"C1 Value", criterion},
    };
}

Rows neighbour(const char* channel, const char* level, const char* criterion, const char* colour)
{
    Rows rows = neighbour(channel, level, criterion);
    rows.emplace_back("BSIC", colour);
    return rows;
}

} // namespace

TEST_F(NeighboringCellsTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "Neighboring Cells");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kMeasurement, kBsicList, kCellRecord));
}

TEST_F(NeighboringCellsTest, MeasuredNeighboursShowInOrder)
{
    send(kMeasurement, measurement({975, 12}));
    EXPECT_THAT(records(), ElementsAre(neighbour("975", "0", "0"), neighbour("12", "1", "10")));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "NeighboringCells"}));
}

TEST_F(NeighboringCellsTest, LevelsAreUnsignedAndCriteriaWhole)
{
    send(kMeasurement, PacketBuilder(kMeasurement, 29 + 14)
                           .put8(28, 1)
                           .put16(29, 65535)
                           .put8(31, 255)
                           .put32(32, 0x00012345));
    EXPECT_THAT(records(), ElementsAre(neighbour("65535", "255", "74565")));
    send(kMeasurement, PacketBuilder(kMeasurement, 29 + 14).put8(28, 1).put32(32, 0xFFFFFFFF));
    EXPECT_THAT(records(), ElementsAre(neighbour("0", "0", "-1")));
}

TEST_F(NeighboringCellsTest, ACountOfZeroEmptiesTheList)
{
    send(kMeasurement, measurement({975, 12}));
    send(kMeasurement, measurement({}));
    EXPECT_THAT(records(), IsEmpty());
}

TEST_F(NeighboringCellsTest, ACountBeyondThePacketShowsTheWholeRecords)
{
    Bytes packet = measurement({975, 12});
    packet[28] = 255;
    // The last seven bytes of a record are not read, so it is whole without them.
    const std::pair<std::size_t, std::size_t> kCells[] = {
        {29,          0},
        {29 + 6,      0},
        {29 + 7,      1},
        {29 + 14 + 6, 1},
        {29 + 14 + 7, 2},
        {29 + 28,     2},
    };
    for (const auto& [size, cells] : kCells) {
        sendCut(kMeasurement, packet, size);
        EXPECT_EQ(records().size(), cells) << size;
    }
}

TEST_F(NeighboringCellsTest, TheLargestCountIsShownWhole)
{
    send(kMeasurement, measurement(std::vector<std::uint32_t>(255, 7)));
    ASSERT_THAT(records(), SizeIs(255));
    EXPECT_EQ(records()[254], neighbour("7", "254", "2540"));
}

TEST_F(NeighboringCellsTest, ShortPacketsLeaveTheEarlierListAndColours)
{
    send(kBsicList, bsicList({
                        {975, 63}
    }));
    send(kMeasurement, measurement({975}));
    expectShorterIsIgnored(kMeasurement, measurement({}), 29);
    expectShorterIsIgnored(kBsicList, bsicList({}), 15);
    send(kMeasurement, measurement({975}));
    EXPECT_THAT(records(), ElementsAre(neighbour("975", "0", "0", "63")));
}

TEST_F(NeighboringCellsTest, ColoursComeFromTheBsicListByChannel)
{
    send(kBsicList, bsicList({
                        {12,  255},
                        {975, 63 }
    }));
    EXPECT_THAT(records(), IsEmpty());
    send(kMeasurement, measurement({975, 500, 12}));
    EXPECT_THAT(records(),
                ElementsAre(neighbour("975", "0", "0", "63"), neighbour("500", "1", "10"),
                            neighbour("12", "2", "20", "255")));
}

TEST_F(NeighboringCellsTest, ALaterBsicListDoesNotChangeNeighboursAlreadyShown)
{
    send(kBsicList, bsicList({
                        {975, 63}
    }));
    send(kMeasurement, measurement({975}));
    send(kBsicList, bsicList({
                        {975, 1}
    }));
    EXPECT_THAT(records(), ElementsAre(neighbour("975", "0", "0", "63")));
    send(kMeasurement, measurement({975}));
    EXPECT_THAT(records(), ElementsAre(neighbour("975", "0", "0", "1")));
}

TEST_F(NeighboringCellsTest, EachBsicListReplacesTheOneBeforeEvenWhenItIsEmpty)
{
    send(kBsicList, bsicList({
                        {975, 63},
                        {12,  5 }
    }));
    send(kBsicList, bsicList({
                        {12, 6}
    }));
    send(kMeasurement, measurement({975, 12}));
    EXPECT_THAT(records(),
                ElementsAre(neighbour("975", "0", "0"), neighbour("12", "1", "10", "6")));
    send(kBsicList, bsicList({}));
    send(kMeasurement, measurement({975, 12}));
    EXPECT_THAT(records(), ElementsAre(neighbour("975", "0", "0"), neighbour("12", "1", "10")));
}

TEST_F(NeighboringCellsTest, TheLaterColourOfAChannelCounts)
{
    send(kBsicList, bsicList({
                        {975, 63},
                        {975, 7 }
    }));
    send(kMeasurement, measurement({975}));
    EXPECT_THAT(records(), ElementsAre(neighbour("975", "0", "0", "7")));
}

TEST_F(NeighboringCellsTest, ABsicCountBeyondThePacketTakesTheWholeEntries)
{
    Bytes list = bsicList({
        {975, 63},
        {12,  5 }
    });
    list[14] = 255;
    // The last byte of an entry is not read, so it is whole without it.
    sendCut(kBsicList, list, 15 + 4 + 2);
    send(kMeasurement, measurement({975, 12}));
    EXPECT_THAT(records(),
                ElementsAre(neighbour("975", "0", "0", "63"), neighbour("12", "1", "10")));
    sendCut(kBsicList, list, 15 + 4 + 3);
    send(kMeasurement, measurement({975, 12}));
    EXPECT_THAT(records(),
                ElementsAre(neighbour("975", "0", "0", "63"), neighbour("12", "1", "10", "5")));
}

TEST_F(NeighboringCellsTest, OtherCodesAreReported)
{
    send(kMeasurement, measurement({975}));
    expectReported(0x5134);
    expectReported(0x51FE);
}

TEST_F(NeighboringCellsTest, NeighboursOfTheTelephonyServerReplaceTheMeasuredOnes)
{
    send(kBsicList, bsicList({
                        {975, 63}
    }));
    send(kMeasurement, measurement({975}));
    send(kCellRecord,
         cellRecord({
             neighbouringGsm({{kTSCellMonitorARFCN, 975}, {kTSCellMonitorRSSI, -50}}
             ),
             neighbouringUmts({{kTSCellMonitorARFCN, 1},   {kTSCellMonitorRSSI, 1}  }
             ),
             servingGsm({{kTSCellMonitorARFCN, 2},   {kTSCellMonitorRSSI, 2}  }
             ),
             neighbouringGsm({{kTSCellMonitorARFCN, 12},  {kTSCellMonitorRSSI, -41}}
             )
    }));
    EXPECT_THAT(records(), ElementsAre(
                               Rows{
                                   {"ARFCN", "975"     },
                                   {"RSSI",  "-100 dBm"}
    },
                               Rows{{"ARFCN", "12"}, {"RSSI", "-82 dBm"}}));
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(NeighboringCellsTest, LevelsOfTheTelephonyServerShowTwiceTheirValueUnlessNotMeasured)
{
    const std::pair<std::int64_t, const char*> kLevels[] = {
        {-50,         "-100 dBm" },
        {32767,       ""         },
        {32766,       "65532 dBm"},
        {2147483647,  "-2 dBm"   },
        {-2147483648, "0 dBm"    },
    };
    for (const auto& [level, text] : kLevels) {
        send(kCellRecord,
             cellRecord({
                 neighbouringGsm({{kTSCellMonitorARFCN, 1}, {kTSCellMonitorRSSI, level}}
                 )
        }));
        EXPECT_THAT(records(), ElementsAre(Rows{
                                   {"ARFCN", "1" },
                                   {"RSSI",  text}
        }));
    }
}

TEST_F(NeighboringCellsTest, ANeighbourIsShownEvenWhenBothItsNumbersAreMissing)
{
    send(kCellRecord, cellRecord({
                          neighbouringGsm(), neighbouringGsm({{kTSCellMonitorRSSI, -1}}
                           )
    }));
    EXPECT_THAT(records(), ElementsAre(
                               Rows{
    },
                               Rows{{"RSSI", "-2 dBm"}}));
    EXPECT_THAT(services.log.errors(), ElementsAre("NeighboringCells: Failed to retrieve ARFCN\n",
                                                   "NeighboringCells: Failed to retrieve RSSI\n",
                                                   "NeighboringCells: Failed to retrieve ARFCN\n"));
}

TEST_F(NeighboringCellsTest, ARecordWithoutNeighboursEmptiesTheList)
{
    send(kMeasurement, measurement({975}));
    send(kCellRecord, cellRecord({
                          servingGsm({{kTSCellMonitorARFCN, 2}}
                          )
    }));
    EXPECT_THAT(records(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(NeighboringCellsTest, ARecordWithoutCellsIsReportedAndEmptiesTheList)
{
    send(kMeasurement, measurement({975}));
    send(kCellRecord, PacketBuilder::withText(kCellRecord, "nonsense"));
    EXPECT_THAT(records(), IsEmpty());
    EXPECT_THAT(services.log.errors(), ElementsAre("Cell Info Array data could not be constructed",
                                                   "Failed to get Cell Array\n"));
    send(kMeasurement, measurement({975}));
    services.log.lines.clear();
    send(kCellRecord, PacketBuilder::withPropertyList(kCellRecord, PropertyValue::newDictionary()));
    EXPECT_THAT(records(), IsEmpty());
    EXPECT_THAT(services.log.errors(), ElementsAre("Failed to get Cell Array\n"));
}

} // namespace orvane
