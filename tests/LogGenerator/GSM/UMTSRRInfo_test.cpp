#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/support/CellRecord.h"
#include "LogGenerator/support/SectionTest.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

using ::testing::AnyOf;
using ::testing::ElementsAre;
using ::testing::IsEmpty;

constexpr std::uint32_t kState = 0x4125;
constexpr std::uint32_t kPower = 0x4031;
constexpr std::uint32_t kIdentity = 0x4127;
constexpr std::uint32_t kCiphering = 0x4157;

using UMTSRRInfoTest = SectionTest<UMTSRRInfo>;

Bytes identityPacket()
{
    return PacketBuilder(kIdentity, 29)
        .put32(13, 9613)
        .put32(17, 10563)
        .put32(21, 268435455)
        .put16(25, 65535);
}

// A packet that claims and holds one record for each reading.
Bytes powerPacket(const std::vector<int>& readings)
{
    PacketBuilder packet(kPower, 16 + 14 * readings.size());
    packet.put8(14, static_cast<std::uint32_t>(readings.size()));
    for (std::size_t i = 0; i < readings.size(); ++i)
        packet.put16(16 + 14 * i + 4, static_cast<std::uint32_t>(readings[i]) & 0xFFFF);
    return packet;
}

PropertyValue servingCell()
{
    return servingUmts({
        {kTSCellMonitorCellId, 77   },
        {kTSCellMonitorUARFCN, 10700},
        {kTSCellMonitorSCN,    300  }
    });
}

} // namespace

TEST_F(UMTSRRInfoTest, ListsItsNameAndCodesInOrder)
{
    EXPECT_EQ(section.getSectionName(), "UMTS RR Info");
    EXPECT_THAT(section.getLogCodeArray(),
                ElementsAre(kState, kPower, kIdentity, kCiphering, kCellRecord));
}

TEST_F(UMTSRRInfoTest, NamesEveryStateAndNoOther)
{
    const char* const kStates[] = {"Disconnected", "Connecting", "CELL_FACH",
                                   "CELL_DCH",     "CELL_PCH",   "URA_PCH"};
    for (std::uint32_t state = 0; state < 256; ++state) {
        send(kState, PacketBuilder(kState, 14).put8(13, state));
        EXPECT_EQ(row("RRC State"), state < 6 ? kStates[state] : "Unknown") << state;
    }
    EXPECT_EQ(services.log.count("UMTSRRInfo"), 256U);
}

TEST_F(UMTSRRInfoTest, IdentityPacketFillsItsRowsInOrder)
{
    send(kIdentity, identityPacket());
    EXPECT_EQ(rows(), (Rows{
                          {"Cell ID",            "268435455"},
                          {"Downlink Frequency", "10563"    },
                          {"Uplink Frequency",   "9613"     },
                          {"URA ID",             "65535"    },
    }));
}

TEST_F(UMTSRRInfoTest, UnsignedFieldsBeyondTheSignedRangeShowAsCShowsThem)
{
    send(kIdentity, PacketBuilder(kIdentity, 29)
                        .put32(13, 0xFFFFFFFF)
                        .put32(17, 0x80000000)
                        .put32(21, 0xFFFFFFFE));
    EXPECT_EQ(row("Uplink Frequency"), "-1");
    EXPECT_EQ(row("Downlink Frequency"), "-2147483648");
    EXPECT_EQ(row("Cell ID"), "-2");
}

TEST_F(UMTSRRInfoTest, CipheringIsOnForEveryValueButZero)
{
    const std::pair<std::uint32_t, const char*> kTexts[] = {
        {0,   "Disabled"},
        {1,   "Enabled" },
        {255, "Enabled" },
    };
    for (const auto& [value, text] : kTexts) {
        send(kCiphering, PacketBuilder(kCiphering, 19).put8(13, value));
        EXPECT_EQ(row("Ciphering"), text) << value;
    }
}

TEST_F(UMTSRRInfoTest, TransmitPowerIsTheMeanOfTheReadings)
{
    const std::pair<std::vector<int>, const char*> kMeans[] = {
        {{0, 88, -112}, "-20.00 dBm"  },
        {{88},          "-10.00 dBm"  },
        {{88, 98, 98},  "-9.33 dBm"   },
        {{1},           "-19.00 dBm"  }, // 513 tenths, cut
        {{-521},        "-70.00 dBm"  }, // -9 tenths, cut towards zero
        {{-522},        "-71.00 dBm"  },
        {{32767},       "3257.00 dBm" },
        {{-32768},      "-3295.00 dBm"},
        {{-512, -502},  "-69.50 dBm"  },
        {{188},         "0.00 dBm"    },
    };
    for (const auto& [readings, text] : kMeans) {
        send(kPower, powerPacket(readings));
        EXPECT_EQ(row("Transmit Power"), text);
    }
}

TEST_F(UMTSRRInfoTest, TransmitPowerOfNoReadingIsNotANumber)
{
    // The sign is the machine's; with it the text fills the width of four, without it a blank does.
    send(kPower, powerPacket({}));
    EXPECT_THAT(row("Transmit Power"), AnyOf("-nan dBm", " nan dBm"));
    send(kPower, powerPacket({88}));
    send(kPower, powerPacket({0, 0}));
    EXPECT_THAT(row("Transmit Power"), AnyOf("-nan dBm", " nan dBm"));
}

TEST_F(UMTSRRInfoTest, OnlyWholeRecordsTakePartInTheMean)
{
    Bytes packet = powerPacket({88, -112});
    packet[14] = 255;
    const std::pair<std::size_t, const char*> kMeans[] = {
        {16 + 6,      "-10.00 dBm"},
        {16 + 14 + 5, "-10.00 dBm"},
        {16 + 14 + 6, "-20.00 dBm"},
        {16 + 28,     "-20.00 dBm"},
    };
    for (const auto& [size, text] : kMeans) {
        sendCut(kPower, packet, size);
        EXPECT_EQ(row("Transmit Power"), text) << size;
    }
    sendCut(kPower, packet, 16 + 5);
    EXPECT_THAT(row("Transmit Power"), AnyOf("-nan dBm", " nan dBm"));
}

TEST_F(UMTSRRInfoTest, TheLargestNumberOfReadingsIsTakenWhole)
{
    std::vector<int> readings(255, 88);
    readings[254] = 88 + 255 * 10;
    send(kPower, powerPacket(readings));
    EXPECT_EQ(row("Transmit Power"), "-9.00 dBm");
}

TEST_F(UMTSRRInfoTest, ShortPacketsLeaveEarlierRowsInPlace)
{
    send(kIdentity, identityPacket());
    send(kState, PacketBuilder(kState, 14).put8(13, 3));
    send(kCiphering, PacketBuilder(kCiphering, 19).put8(13, 1));
    send(kPower, powerPacket({88}));
    expectShorterIsIgnored(kState, PacketBuilder(kState, 14), 14);
    expectShorterIsIgnored(kIdentity, PacketBuilder(kIdentity, 29), 29);
    expectShorterIsIgnored(kCiphering, PacketBuilder(kCiphering, 19), 19);
    expectShorterIsIgnored(kPower, powerPacket({}), 16);
}

TEST_F(UMTSRRInfoTest, OtherCodesAreReported)
{
    expectReported(0x4126);
    expectReported(0x4005);
}

TEST_F(UMTSRRInfoTest, CellsFillTheRowsOfTheServingCell)
{
    send(kCellRecord, cellRecord({
                          servingGsm({{kTSCellMonitorCellId, 1}}
                          ), neighbouringUmts(),
                          servingCell(), servingUmts({{kTSCellMonitorCellId, 2}}
                          )
    }));
    EXPECT_EQ(rows(), (Rows{
                          {"Cell ID",         "77"   },
                          {"UARFCN",          "10700"},
                          {"Scrambling Code", "300"  },
    }));
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(UMTSRRInfoTest, IdentityPacketRemovesTheChannelOfTheCellsAndTheyBringItBack)
{
    send(kCellRecord, cellRecord({servingCell()}));
    send(kIdentity, identityPacket());
    EXPECT_EQ(rows(), (Rows{
                          {"Cell ID",            "268435455"},
                          {"Scrambling Code",    "300"      },
                          {"Downlink Frequency", "10563"    },
                          {"Uplink Frequency",   "9613"     },
                          {"URA ID",             "65535"    },
    }));
    send(kCellRecord, cellRecord({servingCell()}));
    EXPECT_EQ(row("UARFCN"), "10700");
    EXPECT_EQ(row("Cell ID"), "77");
}

TEST_F(UMTSRRInfoTest, ShortIdentityPacketKeepsTheChannelOfTheCells)
{
    send(kCellRecord, cellRecord({servingCell()}));
    sendCut(kIdentity, identityPacket(), 28);
    EXPECT_EQ(row("UARFCN"), "10700");
}

TEST_F(UMTSRRInfoTest, EachMissingNumberIsLoggedAndItsRowLeft)
{
    send(kCellRecord, cellRecord({servingCell()}));
    send(kCellRecord, cellRecord({
                          servingUmts({{kTSCellMonitorSCN, 4}}
                          )
    }));
    EXPECT_THAT(services.log.errors(), ElementsAre("UMTSRRInfo: Failed to retrieve Cell ID\n",
                                                   "UMTSRRInfo: Failed to retrieve UARFCN\n"));
    EXPECT_EQ(rows(), (Rows{
                          {"Cell ID",         "77"   },
                          {"UARFCN",          "10700"},
                          {"Scrambling Code", "4"    },
    }));
    services.log.lines.clear();
    send(kCellRecord, cellRecord({
                          servingUmts({{kTSCellMonitorCellId, 4}, {kTSCellMonitorUARFCN, 5}}
                          )
    }));
    EXPECT_THAT(services.log.errors(),
                ElementsAre("UMTSRRInfo: Failed to retrieve Scrambling Code\n"));
}

TEST_F(UMTSRRInfoTest, CellsThatAreOfNoUseChangeNothing)
{
    send(kCellRecord, cellRecord({servingCell()}));
    const Rows before = rows();
    send(kCellRecord, cellRecord({}));
    send(kCellRecord, cellRecord({
                          neighbouringUmts({{kTSCellMonitorCellId, 1}}
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

TEST_F(UMTSRRInfoTest, WithoutAPartOfTheDisplayNothingIsWritten)
{
    section.updateSectionRef(PropertyValue());
    send(kIdentity, identityPacket());
    send(kPower, powerPacket({88}));
    send(kCellRecord, cellRecord({servingCell()}));
    EXPECT_THAT(rows(), IsEmpty());
}

} // namespace orvane
