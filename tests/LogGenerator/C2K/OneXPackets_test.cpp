#include "LogGenerator/C2K/C2KTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class OneXPacketsTest : public C2KTest
{
protected:
    // A status packet of the four subpackets: system state at 17 (8 bytes), radio at 25 (14 bytes),
    // active set at 39 (with its pilots), fingers at its end (8 bytes).
    static constexpr std::size_t kSystem = 17;
    static constexpr std::size_t kRadio = 25;
    static constexpr std::size_t kActiveSet = 39;

    static PacketBuilder status(unsigned deviceState, unsigned pilots = 0, unsigned pad = 0)
    {
        const std::size_t stride = (6 * pad + 12 + 3) / 4 * 4;
        const std::size_t activeSetBytes = 12 + 16 + 4 * pad + stride * pilots;
        const std::size_t fingers = kActiveSet + activeSetBytes;
        PacketBuilder packet(0x119C, fingers + 8);
        packet.put8(14, 4);
        packet.put8(kSystem, 1).put16(kSystem + 2, 8).put8(kSystem + 4, deviceState);
        packet.put8(kRadio, 2).put16(kRadio + 2, 14);
        packet.put8(kRadio + 4, 1).put8(kRadio + 5, 9).put16(kRadio + 6, 384);
        packet.put16(kRadio + 8, 777).put8(kRadio + 10, 0x80).put8(kRadio + 11, 10);
        packet.put16(kRadio + 12, 0xFF85); // -123
        packet.put8(kActiveSet, 3);
        packet.put16(kActiveSet + 2, static_cast<std::uint32_t>(activeSetBytes));
        packet.put16(kActiveSet + 4, 64).put8(kActiveSet + 6, 1).put8(kActiveSet + 7, 2);
        packet.put8(kActiveSet + 8, pilots).put8(kActiveSet + 9, pad);
        packet.put16(kActiveSet + 10, 20);
        packet.put8(fingers, 4).put16(fingers + 2, 8);
        return packet;
    }
    static std::size_t pilot(unsigned index, unsigned pad = 0)
    {
        return kActiveSet + index * ((6 * pad + 12 + 3) / 4 * 4);
    }

    // Traffic frame errors: one subpacket 11 at 17.
    static PacketBuilder frame(unsigned flag)
    {
        return PacketBuilder(0x119D, 44).put8(14, 1).put8(17, 11).put16(19, 27).put8(41, flag);
    }
};

} // namespace

TEST_F(OneXPacketsTest, InTrafficEveryRowIsShown)
{
    send(status(8));
    EXPECT_EQ(row("k1xDeviceState"), "Traffic [8]");
    EXPECT_EQ(row("k1xRx0BandClass"), "1.8 to 2.0GHz PCS band [1]");
    EXPECT_EQ(row("k1xRx0ChanNum"), "384");
    EXPECT_EQ(row("k1xRxAGC0"), "-106.00 dBm");
    EXPECT_EQ(row("k1xRx1BandClass"), "900 MHzband [9]");
    EXPECT_EQ(row("k1xRx1ChanNum"), "777");
    EXPECT_EQ(row("k1xRxAGC1"), "-59.91 dBm");
    EXPECT_EQ(row("k1xTxAGC"), "-12.30 dBm");
    EXPECT_THAT(services.log.lines, IsEmpty());
}

TEST_F(OneXPacketsTest, OutOfTrafficTheSecondReceiverAndTheTransmitterAreNotAvailable)
{
    send(status(6));
    EXPECT_EQ(row("k1xDeviceState"), "Paging [6]");
    EXPECT_EQ(row("k1xRxAGC0"), "-106.00 dBm");
    for (const char* key : {"k1xRx1BandClass", "k1xRx1ChanNum", "k1xRxAGC1", "k1xTxAGC"})
        EXPECT_EQ(row(key), "N/A") << key;
}

TEST_F(OneXPacketsTest, NamesEveryDeviceState)
{
    const std::vector<std::string> kStates = {"Inactive [0]",
                                              "Deep sleep in start state [1]",
                                              "Initial state for CDMA operation [2]",
                                              "Acquisition [3]",
                                              "Sync [4]",
                                              "Slew [5]",
                                              "Paging [6]",
                                              "Slotted mode sleep state [7]",
                                              "Traffic [8]",
                                              "UnSlew [9]",
                                              "Operation in PCG state [10]",
                                              "Powerup state [11]",
                                              "[Bad Value 12]"};
    for (unsigned value = 0; value < kStates.size(); ++value) {
        send(status(value));
        EXPECT_EQ(row("k1xDeviceState"), kStates[value]);
    }
}

TEST_F(OneXPacketsTest, AShortStatusIsRejected)
{
    send(PacketBuilder(0x119C, 16));
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Log code 0x119c is 16 bytes long but must be at least 17 bytes."));
    services.log.lines.clear();
    send(PacketBuilder(0x119C, 17));
    EXPECT_THAT(
        services.log.lines,
        ElementsAre(RecordingLog::Line{
            LogPriority::Warning, "Log code 0x119c: missing subpacket (ss=0,rf=0,ai=0,fi=0)."}));
}

TEST_F(OneXPacketsTest, AMissingSubpacketRejectsTheWhole)
{
    send(status(8).put8(kRadio, 9));
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("Log code 0x119c: missing subpacket (ss=1,rf=0,ai=1,fi=1)."));
    EXPECT_EQ(row("k1xDeviceState"), "");
}

TEST_F(OneXPacketsTest, TheWalkTakesNoMoreSubpacketsThanTheCount)
{
    send(status(8).put8(14, 3));
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("Log code 0x119c: missing subpacket (ss=1,rf=1,ai=1,fi=0)."));
}

TEST_F(OneXPacketsTest, ASubpacketsSizeIsMeasuredFromTheFirstSubpacketNotFromThePacketsEnd)
{
    // Of 44 bytes: the one subpacket may reach up to, not including, offset 17 + 44.
    send(frame(0).put16(19, 43));
    EXPECT_EQ(row("k1xTrafficFER"), "0.00%");
    EXPECT_THAT(services.log.errors(), IsEmpty());
    send(frame(0).put16(19, 44));
    EXPECT_THAT(services.log.errors(), ElementsAre("Log code error in subpkt#0: bad size (44)."));
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("Log code 0x119d: missing traffic demod subpacket."));
}

TEST_F(OneXPacketsTest, ABadSizeIsToldOnceASearch)
{
    send(status(8).put16(kRadio + 2, 0xFFFF));
    EXPECT_EQ(services.log.count("Log code error in subpkt#1: bad size (65535)."), 3U);
}

TEST_F(OneXPacketsTest, ASubpacketOfNoSizeStaysInPlaceUntilTheCountIsUsedUp)
{
    send(frame(1).put8(14, 255).put8(17, 5).put16(19, 0));
    EXPECT_THAT(services.log.errors(), IsEmpty());
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("Log code 0x119d: missing traffic demod subpacket."));
}

TEST_F(OneXPacketsTest, ASubpacketWhoseHeaderIsCutOffIsNotThere)
{
    PacketBuilder packet(0x119D, 20);
    send(packet.put8(14, 1).put8(17, 11));
    EXPECT_THAT(services.log.errors(), IsEmpty());
    EXPECT_THAT(services.log.warnings(),
                ElementsAre("Log code 0x119d: missing traffic demod subpacket."));
}

TEST_F(OneXPacketsTest, ActiveSetWithoutPilotsHoldsOnlyItsSortingMark)
{
    send(status(8, 0));
    EXPECT_THAT(sortedRows("k1xActiveSetInfo"), IsEmpty());
}

TEST_F(OneXPacketsTest, ActiveSetShowsEachPilotAndMarksTheReference)
{
    // v = 2 E / (9 * 64 * 64) - 1 / 64: E = 1000 gives 0.03863, E = 100 gives the floor.
    // A pad of 1. Without it a record's energy would be the next record's pilot.
    send(status(8, 2, 1)
             .put16(pilot(0, 1) + 12, 20)
             .put16(pilot(0, 1) + 28, 1000)
             .put16(pilot(1, 1) + 12, 32)
             .put16(pilot(1, 1) + 28, 100));
    EXPECT_THAT(sortedRows("k1xActiveSetInfo"),
                ElementsAre("0;20=(ref pilot) -14.13 dB", "1;32=-50.00 dB"));
}

TEST_F(OneXPacketsTest, PilotRecordsAreSpacedByTheirPadRoundedUpToFour)
{
    // A pad of 1: 18 bytes a record, rounded up to 20, and the energy 4 bytes later.
    send(status(8, 2, 1)
             .put16(pilot(0, 1) + 12, 1)
             .put16(pilot(0, 1) + 28, 1000)
             .put16(pilot(1, 1) + 12, 2)
             .put16(pilot(1, 1) + 28, 2000));
    EXPECT_THAT(sortedRows("k1xActiveSetInfo"), ElementsAre("0;1=-14.13 dB", "1;2=-10.32 dB"));
    // A pad of 2 makes 24 bytes, which need no rounding.
    send(status(8, 2, 2)
             .put16(pilot(0, 2) + 12, 3)
             .put16(pilot(0, 2) + 32, 2000)
             .put16(pilot(1, 2) + 12, 4)
             .put16(pilot(1, 2) + 32, 1000));
    EXPECT_THAT(sortedRows("k1xActiveSetInfo"), ElementsAre("0;3=-10.32 dB", "1;4=-14.13 dB"));
}

TEST_F(OneXPacketsTest, ZeroDivisorsComeOutAsArithmeticGivesThem)
{
    // Energy divided by zero, minus a finite number, is infinite.
    send(status(8, 1).put8(kActiveSet + 6, 0).put16(pilot(0) + 12, 1).put16(pilot(0) + 24, 9));
    EXPECT_THAT(sortedRows("k1xActiveSetInfo"), ElementsAre("0;1=+inf dB"));
    // Infinity minus infinity is not a number. No comparison raises that to the floor.
    send(status(8, 1).put16(kActiveSet + 4, 0).put16(pilot(0) + 12, 1).put16(pilot(0) + 24, 9));
    EXPECT_THAT(sortedRows("k1xActiveSetInfo"),
                ElementsAre(::testing::MatchesRegex("0;1=.nan dB")));
}

TEST_F(OneXPacketsTest, AnActiveSetOfWhichAByteIsMissingLeavesItsRow)
{
    send(status(8, 1).put16(pilot(0) + 12, 20).put16(pilot(0) + 24, 1000));
    const auto before = sortedRows("k1xActiveSetInfo");
    // All four subpackets' headers lie before the active set's pilots, which end the packet.
    PacketBuilder packet(0x119C, 17 + 8 + 14 + 8 + 26);
    packet.put8(14, 4).put8(17, 1).put16(19, 8).put8(21, 8);
    packet.put8(25, 2).put16(27, 14).put8(39, 4).put16(41, 8);
    packet.put8(47, 3).put16(49, 12).put16(51, 64).put8(53, 1).put8(54, 2).put8(55, 1);
    packet.put16(47 + 12, 5).put16(47 + 24, 1000);
    sendCut(packet, packet.bytes().size() - 1);
    EXPECT_EQ(sortedRows("k1xActiveSetInfo"), before);
    EXPECT_EQ(row("k1xDeviceState"), "Traffic [8]");
    send(packet);
    EXPECT_THAT(sortedRows("k1xActiveSetInfo"), ElementsAre("0;5=-14.13 dB"));
}

TEST_F(OneXPacketsTest, ADeviceStateThatIsMissingLeavesWhatDependsOnIt)
{
    send(frame(1));
    send(status(8));
    // The system state is the last subpacket and ends with its header.
    PacketBuilder packet(0x119C, 17 + 14 + 12 + 8 + 4);
    packet.put8(14, 4).put8(17, 2).put16(19, 14).put8(31, 3).put16(33, 12);
    packet.put8(43, 4).put16(45, 8).put8(51, 1).put16(53, 4);
    send(packet);
    EXPECT_THAT(services.log.warnings(), IsEmpty());
    EXPECT_EQ(row("k1xDeviceState"), "Traffic [8]");
    EXPECT_EQ(row("k1xTxAGC"), "-12.30 dBm");
    EXPECT_EQ(row("k1xTrafficFER"), "1.56%");
    EXPECT_EQ(row("k1xRx0ChanNum"), "0") << "the radio's own rows are shown";
}

TEST_F(OneXPacketsTest, FrameErrorsAreAMovingAverageInSinglePrecision)
{
    const char* const kRates[] = {"1.56%", "3.10%", "4.61%"};
    for (const char* rate : kRates) {
        send(frame(1));
        EXPECT_EQ(row("k1xTrafficFER"), rate);
    }
    send(frame(0));
    EXPECT_EQ(row("k1xTrafficFER"), "4.54%");
    const float first = 0.015625F;
    const float second = first + 0.984375F * first;
    const float third = first + 0.984375F * second;
    const float fourth = 0.984375F * third;
    EXPECT_EQ(state["TrafficFER"], PropertyValue::real(static_cast<double>(fourth)));
}

TEST_F(OneXPacketsTest, LeavingTrafficShowsTheErrorRateOnceAsOld)
{
    send(frame(1));
    send(status(8));
    EXPECT_EQ(row("k1xTrafficFER"), "1.56%");
    send(status(6));
    EXPECT_EQ(row("k1xTrafficFER"), "1.56% (old)");
    EXPECT_FALSE(state.contains("TrafficFER"));
    send(frame(0));
    EXPECT_EQ(row("k1xTrafficFER"), "0.00%") << "the average starts anew";
    state.remove("TrafficFER");
    send(status(6));
    EXPECT_EQ(row("k1xTrafficFER"), "0.00%") << "shown as old once only";
}

TEST_F(OneXPacketsTest, AShortFramePacketIsRejected)
{
    send(PacketBuilder(0x119D, 16));
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Log code 0x119d is 16 bytes long but must be at least 17 bytes."));
}

TEST_F(OneXPacketsTest, AFrameFlagThatIsMissingLeavesTheRate)
{
    send(frame(1));
    sendCut(frame(1), 41);
    EXPECT_EQ(row("k1xTrafficFER"), "1.56%");
    sendCut(frame(1), 42);
    EXPECT_EQ(row("k1xTrafficFER"), "3.10%");
}

} // namespace orvane
