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

constexpr std::uint32_t kCell = 0x5134;
constexpr std::uint32_t kMeasurement = 0x5137;
constexpr std::uint32_t kDedicated = 0x5076;

using GSMServingCellTest = SectionTest<GSMServingCell>;

Bytes cellPacket()
{
    return PacketBuilder(kCell, 26).put16(13, 975).put16(15, 63).put16(17, 65535);
}

PropertyValue servingCell()
{
    return servingGsm({
        {kTSCellMonitorCellId, 4711},
        {kTSCellMonitorARFCN,  12  }
    });
}

} // namespace

TEST_F(GSMServingCellTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "GSM Serving Cell");
    EXPECT_THAT(section.getLogCodeArray(),
                ElementsAre(kCell, kMeasurement, kDedicated, kCellRecord));
}

TEST_F(GSMServingCellTest, CellPacketFillsItsRowsInOrder)
{
    send(kCell, cellPacket());
    EXPECT_EQ(rows(), (Rows{
                          {"Cell ID", "65535"},
                          {"ARFCN",   "975"  },
                          {"BSIC",    "63"   },
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "GSMServingCell"}));
}

TEST_F(GSMServingCellTest, MeasurementPacketFillsItsRowsInOrder)
{
    send(kMeasurement, PacketBuilder(kMeasurement, 29).put8(15, 71).put32(16, 32).put32(20, 40));
    EXPECT_EQ(rows(), (Rows{
                          {"RSSI",     "71 dBm"},
                          {"C1 Value", "32"    },
                          {"C2 Value", "40"    },
    }));
}

TEST_F(GSMServingCellTest, TheLevelIsAnUnsignedByteThatIsNotNegated)
{
    send(kMeasurement, PacketBuilder(kMeasurement, 29).put8(15, 200));
    EXPECT_EQ(row("RSSI"), "200 dBm");
}

TEST_F(GSMServingCellTest, CriteriaAreCutToTheirLow16Bits)
{
    send(kMeasurement, PacketBuilder(kMeasurement, 29).put32(16, 0x0001FFFF).put32(20, 0xFFFF0003));
    EXPECT_EQ(row("C1 Value"), "65535");
    EXPECT_EQ(row("C2 Value"), "3");
}

TEST_F(GSMServingCellTest, TheDedicatedChannelIsCutToItsLow8Bits)
{
    const std::pair<std::uint32_t, const char*> kChannels[] = {
        {0x0123, "35" },
        {0x00FF, "255"},
        {0x0100, "0"  },
    };
    for (const auto& [channel, text] : kChannels) {
        send(kDedicated, PacketBuilder(kDedicated, 17).put16(13, channel));
        EXPECT_EQ(rows(), (Rows{
                              {"MA Dedicated ARFCN", text}
        }));
    }
}

TEST_F(GSMServingCellTest, ShortPacketsLeaveEarlierRowsInPlace)
{
    send(kCell, cellPacket());
    send(kMeasurement, PacketBuilder(kMeasurement, 29).put8(15, 71));
    send(kDedicated, PacketBuilder(kDedicated, 17).put8(13, 9));
    expectShorterIsIgnored(kCell, PacketBuilder(kCell, 26), 26);
    expectShorterIsIgnored(kMeasurement, PacketBuilder(kMeasurement, 29), 29);
    expectShorterIsIgnored(kDedicated, PacketBuilder(kDedicated, 17), 17);
}

TEST_F(GSMServingCellTest, OtherCodesAreReported)
{
    expectReported(0x5135);
    expectReported(0x51FF);
}

TEST_F(GSMServingCellTest, TheFirstServingCellFillsTheRows)
{
    send(kCellRecord,
         cellRecord({
             neighbouringGsm({{kTSCellMonitorCellId, 1}}
             ), servingUmts({{kTSCellMonitorCellId, 2}}
             ),
             servingCell(), servingGsm({{kTSCellMonitorCellId, 3}}
             )
    }));
    EXPECT_EQ(rows(), (Rows{
                          {"Cell ID", "4711"},
                          {"ARFCN",   "12"  },
    }));
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(GSMServingCellTest, EachMissingNumberIsLoggedAndItsRowLeft)
{
    send(kCell, cellPacket());
    send(kCellRecord, cellRecord({
                          servingGsm({{kTSCellMonitorARFCN, 5}}
                          )
    }));
    EXPECT_THAT(services.log.errors(), ElementsAre("GSMServingCell: Failed to retrieve Cell ID\n"));
    EXPECT_EQ(row("Cell ID"), "65535");
    EXPECT_EQ(row("ARFCN"), "5");
    services.log.lines.clear();
    send(kCellRecord, cellRecord({
                          servingGsm({{kTSCellMonitorCellId, 6}}
                          )
    }));
    EXPECT_THAT(services.log.errors(), ElementsAre("GSMServingCell: Failed to retrieve ARFCN\n"));
    EXPECT_EQ(row("Cell ID"), "6");
    EXPECT_EQ(row("ARFCN"), "5");
}

TEST_F(GSMServingCellTest, CellsThatAreOfNoUseChangeNothing)
{
    send(kCellRecord, cellRecord({servingCell()}));
    const Rows before = rows();
    send(kCellRecord, cellRecord({}));
    send(kCellRecord, cellRecord({
                          neighbouringGsm({{kTSCellMonitorCellId, 1}}
                          )
    }));
    EXPECT_THAT(services.log.errors(), IsEmpty());
    send(kCellRecord, PacketBuilder::withText(kCellRecord, "nonsense"));
    EXPECT_THAT(services.log.errors(), ElementsAre("Cell Info Array data could not be constructed",
                                                   "Failed to get Cell Array\n"));
    services.log.lines.clear();
    send(kCellRecord, PacketBuilder::withPropertyList(kCellRecord, PropertyValue::newDictionary()));
    EXPECT_THAT(services.log.errors(), ElementsAre("Failed to get Cell Array\n"));
    EXPECT_EQ(rows(), before);
}

TEST_F(GSMServingCellTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kCell, cellPacket());
    send(kCellRecord, cellRecord({servingCell()}));
    EXPECT_THAT(rows(), IsEmpty());
}

} // namespace orvane
