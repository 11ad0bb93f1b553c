#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kConfiguration = 0xB0C2;
constexpr std::uint32_t kBroadcast = 0xB0C1;
constexpr std::uint32_t kCells = 0xFF0001;

using LTEServingCellInfoTest = SectionTest<LTEServingCellInfo>;

Bytes configurationPacket(std::size_t size = 38)
{
    return PacketBuilder(kConfiguration, size)
        .put16(14, 501)
        .put16(16, 1300)
        .put16(18, 19300)
        .put8(20, 100)
        .put8(21, 50)
        .put32(22, 0x01A2B303)
        .put16(26, 0xFFFE)
        .put32(28, 3);
}

PropertyValue cell(const char* technology, const char* type)
{
    return PropertyValue::dictionaryOf({
        {kTSCellMonitorCellRadioAccessTechnology, technology},
        {kTSCellMonitorCellType,                  type      }
    });
}

PropertyValue servingCell(std::int64_t first)
{
    PropertyValue value =
        cell(kTSCellMonitorRadioAccessTechnologyLTE, kTSCellMonitorCellTypeServing);
    for (const char* key : {kTSCellMonitorTAC, kTSCellMonitorCellId, kTSCellMonitorPID,
                            kTSCellMonitorBandInfo, kTSCellMonitorUARFCN})
        value.asDictionary()->set(key, PropertyValue::integer(first++));
    return value;
}

Bytes cellsMessage(std::initializer_list<PropertyValue> cells)
{
    return PacketBuilder::withPropertyList(kCells, PropertyValue::arrayOf(cells));
}

} // namespace

TEST_F(LTEServingCellInfoTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "Serving Cell Info");
    EXPECT_THAT(section.getLogCodeArray(), ElementsAre(kConfiguration, kBroadcast, kCells));
}

TEST_F(LTEServingCellInfoTest, ConfigurationPacketFillsItsRowsInOrder)
{
    send(kConfiguration, configurationPacket());
    EXPECT_EQ(rows(), (Rows{
                          {"Physical Cell ID",    "501"     },
                          {"Download Frequency",  "1300"    },
                          {"Upload Frequency",    "19300"   },
                          {"Download Bandwidth",  "20 MHz"  },
                          {"Upload Bandwidth",    "10 MHz"  },
                          {"Cell Identity",       "27439875"},
                          {"Tracking Area Code",  "65534"   },
                          {"Freq Band Indicator", "3"       },
    }));
    EXPECT_THAT(services.log.lines,
                ElementsAre(RecordingLog::Line{LogPriority::Warning, "LTE Serving Cell Info"}));
}

TEST_F(LTEServingCellInfoTest, ConfigurationPacketOneByteShortChangesNothing)
{
    send(kConfiguration, configurationPacket(37));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(LTEServingCellInfoTest, NamesEveryBandwidthAndNoOther)
{
    const std::pair<std::uint32_t, const char*> kBandwidths[] = {
        {6,   "1.4 MHz"},
        {15,  "3 MHz"  },
        {25,  "5 MHz"  },
        {50,  "10 MHz" },
        {75,  "15 MHz" },
        {100, "20 MHz" },
        {0,   "Unknown"},
        {7,   "Unknown"},
        {255, "Unknown"},
    };
    for (const auto& [blocks, text] : kBandwidths) {
        PacketBuilder packet(kConfiguration, 38);
        send(kConfiguration, packet.put8(20, blocks).put8(21, blocks));
        EXPECT_EQ(row("Download Bandwidth"), text) << blocks;
        EXPECT_EQ(row("Upload Bandwidth"), text) << blocks;
    }
}

TEST_F(LTEServingCellInfoTest, UnsignedFieldsBeyondTheSignedRangeShowAsCShowsThem)
{
    send(kConfiguration,
         PacketBuilder(kConfiguration, 38).put32(22, 0xFFFFFFFF).put32(28, 0x80000000));
    EXPECT_EQ(row("Cell Identity"), "-1");
    EXPECT_EQ(row("Freq Band Indicator"), "-2147483648");
}

TEST_F(LTEServingCellInfoTest, BroadcastPacketWritesItsRowAndIsReportedAsUnknownAllTheSame)
{
    send(kBroadcast, PacketBuilder(kBroadcast, 22).put8(20, 4));
    EXPECT_EQ(row("Num Tx Antennas"), "4");
    EXPECT_THAT(services.log.errors(), ElementsAre("Received an unknown log message: 45249"));
}

TEST_F(LTEServingCellInfoTest, BroadcastPacketOneByteShortIsIgnoredSilently)
{
    send(kBroadcast, PacketBuilder(kBroadcast, 21).put8(20, 4));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(LTEServingCellInfoTest, OtherCodesAreReported)
{
    send(0xB0C3, PacketBuilder(0xB0C3, 40));
    EXPECT_THAT(services.log.errors(), ElementsAre("Received an unknown log message: 45251"));
    EXPECT_THAT(rows(), IsEmpty());
}

TEST_F(LTEServingCellInfoTest, CellsFillTheRowsOfTheServingCell)
{
    send(kCells, cellsMessage({servingCell(10)}));
    EXPECT_EQ(rows(), (Rows{
                          {"Tracking Area Code",  "10"},
                          {"Cell Identity",       "11"},
                          {"Physical Cell ID",    "12"},
                          {"Freq Band Indicator", "13"},
                          {"UARFCN",              "14"},
    }));
}

TEST_F(LTEServingCellInfoTest, ConfigurationPacketRemovesTheChannelOfTheCells)
{
    send(kCells, cellsMessage({servingCell(10)}));
    send(kConfiguration, configurationPacket());
    EXPECT_EQ(row("UARFCN"), "(no row)");
    EXPECT_EQ(row("Tracking Area Code"), "65534");
}

TEST_F(LTEServingCellInfoTest, ShortConfigurationPacketKeepsTheChannelOfTheCells)
{
    send(kCells, cellsMessage({servingCell(10)}));
    send(kConfiguration, configurationPacket(37));
    EXPECT_EQ(row("UARFCN"), "14");
}

TEST_F(LTEServingCellInfoTest, TheFirstServingCellIsTaken)
{
    const PropertyValue noType = PropertyValue::dictionaryOf({
        {kTSCellMonitorCellRadioAccessTechnology, kTSCellMonitorRadioAccessTechnologyLTE}
    });
    send(kCells, cellsMessage({noType, "text", servingCell(20), servingCell(30)}));
    EXPECT_EQ(row("Cell Identity"), "21");
}

TEST_F(LTEServingCellInfoTest, OtherCellsChangeNothingAndLogNothing)
{
    send(kCells,
         cellsMessage(
             {cell(kTSCellMonitorRadioAccessTechnologyLTE, kTSCellMonitorCellTypeNeighbor),
              cell(kTSCellMonitorRadioAccessTechnologyUTRAN2, kTSCellMonitorCellTypeServing)}));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(LTEServingCellInfoTest, EmptyCellArrayChangesNothingAndLogsNothing)
{
    send(kCells, cellsMessage({}));
    EXPECT_THAT(rows(), IsEmpty());
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(LTEServingCellInfoTest, EachMissingNumberIsLoggedAndItsRowLeft)
{
    send(kCells, cellsMessage({servingCell(10)}));
    services.log.lines.clear();
    send(kCells, cellsMessage({cell(kTSCellMonitorRadioAccessTechnologyLTE,
                                    kTSCellMonitorCellTypeServing)}));
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Serving Cell Info: Failed to retrieve TAC\n",
                            "Serving Cell Info: Failed to retrieve Cell ID\n",
                            "Serving Cell Info: Failed to retrieve Physical Cell ID\n",
                            "Serving Cell Info: Failed to retrieve Freq Band Indicator\n",
                            "Serving Cell Info: Failed to retrieve UARFCN\n"));
    EXPECT_EQ(row("Tracking Area Code"), "10");
    EXPECT_EQ(row("UARFCN"), "14");
}

TEST_F(LTEServingCellInfoTest, AFailedNumberDoesNotKeepTheNextFromBeingShown)
{
    PropertyValue serving = servingCell(10);
    serving.asDictionary()->set(kTSCellMonitorTAC, "12");
    send(kCells, cellsMessage({serving}));
    EXPECT_EQ(row("Tracking Area Code"), "(no row)");
    EXPECT_EQ(row("Cell Identity"), "11");
    EXPECT_THAT(services.log.errors(), ElementsAre("Serving Cell Info: Failed to retrieve TAC\n"));
}

TEST_F(LTEServingCellInfoTest, CellsThatCannotBeParsedGiveTwoErrorLines)
{
    send(kCells, PacketBuilder::withText(kCells, "nonsense"));
    EXPECT_THAT(services.log.errors(), ElementsAre("Cell Info Array data could not be constructed",
                                                   "Failed to get Cell Array\n"));
}

TEST_F(LTEServingCellInfoTest, ARootThatIsNoArrayGivesOneErrorLine)
{
    send(kCells, PacketBuilder::withPropertyList(kCells, PropertyValue::newDictionary()));
    EXPECT_THAT(services.log.errors(), ElementsAre("Failed to get Cell Array\n"));
}

TEST_F(LTEServingCellInfoTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kConfiguration, configurationPacket());
    send(kCells, cellsMessage({servingCell(10)}));
    EXPECT_THAT(rows(), IsEmpty());
}

} // namespace orvane
