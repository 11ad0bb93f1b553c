#include "LogGenerator/C2K/C2KTest.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class EvdoPacketsTest : public C2KTest
{
};

PacketBuilder summary(std::size_t size = 50)
{
    PacketBuilder packet(0x1183, size);
    packet
        .put16(13, 0x0C6E) // channel 0x46E, band class 1
        .put8(15, 0xB0)
        .put8(16, 0xB1)
        .put8(17, 5)
        .put16(18, 168)
        .put8(36, 5)
        .put8(37, 4)
        .put16(38, 0x5678)
        .put8(40, 0x12)
        .put8(41, 77);
    return packet;
}

PacketBuilder pilots(unsigned count, std::size_t size)
{
    return PacketBuilder(0x12B6, size).put8(15, count);
}

PacketBuilder fingers(unsigned count, std::size_t size)
{
    return PacketBuilder(0x108A, size).put8(22, count);
}

} // namespace

TEST_F(EvdoPacketsTest, SummaryShowsItsRows)
{
    send(summary());
    EXPECT_EQ(row("kChannel"), "1134");
    EXPECT_EQ(row("k1xEVDODeviceState"), "Connected [5]");
    EXPECT_EQ(row("kBandClass"), "1.8 to 2.0GHz PCS band [1]");
    EXPECT_EQ(row("kRxAGC0"), "-80 dBm");
    EXPECT_EQ(row("kRxAGC1"), "-79 dBm");
    EXPECT_EQ(row("kTxAGC"), "+5 dBm");
    EXPECT_EQ(row("kServingPNOffset"), "168 × 64chips");
    EXPECT_EQ(row("kSessionState"), "Open [4]");
    EXPECT_EQ(row("kUATI24"), "0x125678");
    EXPECT_EQ(row("kColorCode"), "77");
    EXPECT_THAT(services.log.errors(), IsEmpty());
}

TEST_F(EvdoPacketsTest, SummaryMustBeExactlyFiftyBytes)
{
    for (const std::size_t size : {49U, 51U}) {
        services.log.lines.clear();
        send(summary(size));
        EXPECT_EQ(row("kChannel"), "");
        EXPECT_THAT(services.log.errors(),
                    ElementsAre("Log code 0x1183 is " + std::to_string(size) +
                                " bytes long but should be 50 bytes."));
    }
}

TEST_F(EvdoPacketsTest, SecondReceiverAndTransmitterShowFromTheAccessStateOn)
{
    send(summary().put8(36, 3));
    EXPECT_EQ(row("kRxAGC1"), "N/A");
    EXPECT_EQ(row("kTxAGC"), "N/A");
    EXPECT_EQ(row("kRxAGC0"), "-80 dBm");
    send(summary().put8(36, 4));
    EXPECT_EQ(row("kRxAGC1"), "-79 dBm");
    EXPECT_EQ(row("kTxAGC"), "+5 dBm");
}

TEST_F(EvdoPacketsTest, NoServingPilotIsAnInvalidValue)
{
    send(summary().put16(18, 0xFFFF));
    EXPECT_EQ(row("kServingPNOffset"), "Invalid Value");
    send(summary().put16(18, 0xFFFE));
    EXPECT_EQ(row("kServingPNOffset"), "65534 × 64chips");
}

TEST_F(EvdoPacketsTest, IdentifierIsShownWithSixDigits)
{
    send(summary().put16(38, 0x000A).put8(40, 0));
    EXPECT_EQ(row("kUATI24"), "0x00000a");
}

TEST_F(EvdoPacketsTest, NamesEveryState)
{
    const std::vector<std::string> kDevice = {"Inactive [0]", "Acquisition [1]", "Sync [2]",
                                              "Idle [3]",     "Access [4]",      "Connected [5]",
                                              "[Reserved 6]"};
    for (unsigned value = 0; value < kDevice.size(); ++value) {
        send(summary().put8(36, value));
        EXPECT_EQ(row("k1xEVDODeviceState"), kDevice[value]);
    }
    const std::vector<std::string> kSession = {
        "Closed [0]",        "AMP setup [1]", "AT-initiated neg [2]",
        "Initiated neg [3]", "Open [4]",      "[Reserved 5]"};
    for (unsigned value = 0; value < kSession.size(); ++value) {
        send(summary().put8(37, value));
        EXPECT_EQ(row("kSessionState"), kSession[value]);
    }
    send(summary().put8(37, 255));
    EXPECT_EQ(row("kSessionState"), "[Reserved 255]");
}

TEST_F(EvdoPacketsTest, NamesEveryBandClassWithItsMissingBlank)
{
    const std::vector<std::string> kBands = {"800 MHz cellular band [0]",
                                             "1.8 to 2.0GHz PCS band [1]",
                                             "872 to 960MHz TACS band [2]",
                                             "832 to 925MHz JTACS band [3]",
                                             "1.75 to 1.87GHz Korean PCS band [4]",
                                             "450MHz band [5]",
                                             "2GHz band [6]",
                                             "700MHz band [7]",
                                             "1800 MHz band [8]",
                                             "900 MHzband [9]",
                                             "Secondary 800 MHz band [10]",
                                             "400 MHz European PAMR band [11]",
                                             "800 MHz European PAMR band [12]",
                                             "[Bad Value 13]"};
    for (unsigned value = 0; value < kBands.size(); ++value) {
        send(summary().putBits(14, 3, 5, value));
        EXPECT_EQ(row("kBandClass"), kBands[value]);
    }
    send(summary().putBits(14, 3, 5, 31));
    EXPECT_EQ(row("kBandClass"), "[Bad Value 31]");
}

TEST_F(EvdoPacketsTest, ActiveSetShowsARowAPilotInOrder)
{
    send(pilots(2, 49).put16(25, 168).put16(27, 512).put16(37, 4).put16(39, 256));
    EXPECT_THAT(sortedRows("kActiveSetPilots"), ElementsAre("0;168=+0.00 dB", "1;4=-3.01 dB"));
}

TEST_F(EvdoPacketsTest, ActiveSetWithoutEnergyIsMinusInfinity)
{
    send(pilots(1, 37).put16(25, 7));
    EXPECT_THAT(sortedRows("kActiveSetPilots"), ElementsAre("0;7=-inf dB"));
}

TEST_F(EvdoPacketsTest, ActiveSetOfNoPilotsSaysSo)
{
    send(pilots(0, 25));
    EXPECT_EQ(row("kActiveSetPilots"), "(none)");
}

TEST_F(EvdoPacketsTest, ActiveSetIsRejectedBelowItsLengths)
{
    send(pilots(0, 24));
    send(pilots(2, 48));
    EXPECT_EQ(row("kActiveSetPilots"), "");
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Log code 0x12b6 is 24 bytes long but must be at least 25 bytes.",
                            "Log code 0x12b6 is 48 bytes long, but has 2 substructs."));
    send(pilots(2, 50));
    EXPECT_THAT(sortedRows("kActiveSetPilots"), ::testing::SizeIs(2)) << "longer is fine";
}

TEST_F(EvdoPacketsTest, FingersWithoutAPilotAreSkippedButCounted)
{
    send(fingers(3, 65)
             .put16(23, 10)
             .put16(29, 1024)
             .put16(37, 0xFFFF)
             .put16(51, 12)
             .put16(57, 512));
    EXPECT_THAT(sortedRows("kFingerC2I"), ElementsAre("0;10=+3.01 dB", "2;12=+0.00 dB"));
}

TEST_F(EvdoPacketsTest, FingersOfNoPilotsAtAllSaySo)
{
    send(fingers(2, 51).put16(23, 0xFFFF).put16(37, 0xFFFF));
    EXPECT_EQ(row("kFingerC2I"), "(none)");
    send(fingers(0, 23));
    EXPECT_EQ(row("kFingerC2I"), "(none)");
}

TEST_F(EvdoPacketsTest, FingersMustHaveExactlyTheLengthOfTheirCount)
{
    send(fingers(0, 22 + 1).put8(22, 0));
    services.log.lines.clear();
    send(PacketBuilder(0x108A, 22));
    send(fingers(1, 36));
    send(fingers(1, 38));
    EXPECT_THAT(
        services.log.errors(),
        ElementsAre("Log code 0x108a is 22 bytes long but must be at least 23 bytes.",
                    "Log code 0x108a has bad length of 36 bytes, but has 1 substructs (size=23).",
                    "Log code 0x108a has bad length of 38 bytes, but has 1 substructs (size=23)."));
    EXPECT_EQ(row("kFingerC2I"), "(none)");
}

} // namespace orvane
