#include "LogGenerator/C2K/C2KTest.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

class DataRateTest : public C2KTest
{
};
class SystemIdentityTest : public C2KTest
{
};

PacketBuilder forward(std::uint32_t sequence, std::size_t size = 241)
{
    PacketBuilder packet(0x1192, size);
    return packet.put32(13, sequence);
}

PacketBuilder reverse(std::uint32_t sequence, std::size_t size = 1750)
{
    PacketBuilder packet(0x127E, size);
    return packet.put32(14, sequence);
}

PacketBuilder identity(std::size_t size = 186)
{
    PacketBuilder packet(0x134F, size);
    packet.put8(13, 2).put32(42, 0).put32(46, 2).put16(50, 4139).put16(52, 65535);
    packet.put8(131, 7).put8(133, 6);
    return packet;
}

} // namespace

TEST_F(DataRateTest, TheFirstPacketShowsAnEmptyRate)
{
    send(forward(5).put32(17, 8));
    EXPECT_EQ(row("kFLDataRate"), "");
    EXPECT_EQ(state["FLDataSeqNum"], PropertyValue::integer(5));
    EXPECT_EQ(state["FLDataSent"], PropertyValue::integer(8 * 128));
}

TEST_F(DataRateTest, TheRateIsTheBitsOverTheSequenceNumbers)
{
    send(forward(5));
    send(forward(7).put32(17 + 4 * 3, 10)); // 10 frames of 1024 bits in 2 sequence numbers
    EXPECT_EQ(row("kFLDataRate"), "5.00 kbps");
    const PropertyValue& extra = state["ExtraInfo"];
    EXPECT_EQ(extra["FLDataSeqNum1"], PropertyValue::integer(7));
    EXPECT_EQ(extra["FLDataSent1"], PropertyValue::integer(10240));
    EXPECT_EQ(extra["FLDataSeqNum2"], PropertyValue::integer(5));
    EXPECT_EQ(extra["FLDataSent2"], PropertyValue::integer(0));
}

TEST_F(DataRateTest, AnUnchangedOrOlderSequenceLeavesTheRate)
{
    send(forward(5));
    send(forward(6).put32(17, 16));
    EXPECT_EQ(row("kFLDataRate"), "2.00 kbps");
    send(forward(6).put32(17, 160));
    EXPECT_EQ(row("kFLDataRate"), "2.00 kbps");
    send(forward(4).put32(17, 1600));
    EXPECT_EQ(row("kFLDataRate"), "2.00 kbps");
    EXPECT_EQ(state["FLDataSeqNum"], PropertyValue::integer(4)) << "stored all the same";
}

TEST_F(DataRateTest, ASequenceThatWrapsGoesOn)
{
    send(forward(0xFFFFFFFF));
    send(forward(1).put32(17, 16));
    EXPECT_EQ(row("kFLDataRate"), "1.00 kbps");
}

TEST_F(DataRateTest, FewerBitsThanBeforeAreANegativeRate)
{
    send(forward(1).put32(17, 16));
    send(forward(2));
    EXPECT_EQ(row("kFLDataRate"), "-2.00 kbps");
}

TEST_F(DataRateTest, EveryForwardCounterHasItsWeight)
{
    const std::int64_t kWeights[] = {
        128,  256,  512, 1024, 0,    128,  256,  512,  1024, 0,    128,  256,  512,  1024,
        0,    128,  256, 512,  1024, 0,    128,  256,  512,  1024, 0,    512,  1024, 2048,
        0,    128,  256, 512,  1024, 0,    512,  1024, 2048, 0,    1024, 3072, 0,    512,
        1024, 2048, 0,   4096, 0,    1024, 3072, 0,    4096, 0,    5120, 0,    5120, 0};
    for (unsigned i = 0; i < 56; ++i) {
        send(forward(1).put32(17 + 4 * i, 0xFFFFFFFF));
        EXPECT_EQ(state["FLDataSent"], PropertyValue::integer(0xFFFFFFFFLL * kWeights[i])) << i;
    }
}

TEST_F(DataRateTest, EveryReverseCounterHasItsWeight)
{
    const std::int64_t kWeights[] = {128,  256,  512,  768,  1024, 1536,
                                     2048, 3072, 4096, 6144, 8192, 12288};
    for (unsigned rate = 0; rate < 12; ++rate)
        for (unsigned block = 0; block < 3; ++block)
            for (const unsigned offset : {18U, 22U, 26U, 30U, 306U, 310U, 314U, 318U}) {
                send(reverse(1).put32(24 * rate + 576 * block + offset, 3));
                EXPECT_EQ(state["RLDataSent"], PropertyValue::integer(3 * kWeights[rate]));
            }
}

TEST_F(DataRateTest, TheReverseRateKeepsItsOwnTotals)
{
    send(reverse(1));
    send(reverse(3).put32(18, 16));
    EXPECT_EQ(row("kRLDataRate"), "1.00 kbps");
    EXPECT_EQ(row("kFLDataRate"), "");
    EXPECT_EQ(state["ExtraInfo"]["RLDataSeqNum2"], PropertyValue::integer(1));
    EXPECT_EQ(state["ExtraInfo"]["RLDataSent1"], PropertyValue::integer(2048));
    EXPECT_FALSE(state.contains("FLDataSeqNum"));
}

TEST_F(DataRateTest, ShortPacketsAreRejected)
{
    send(forward(1, 240));
    send(reverse(1, 1749));
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Log code 0x1192 is 240 bytes long but must be at least 241 bytes.",
                            "Log code 0x127e is 1749 bytes long but must be at least 1750 bytes."));
    EXPECT_FALSE(state.contains("FLDataSeqNum"));
    EXPECT_FALSE(state.contains("RLDataSeqNum"));
    send(forward(1, 242));
    send(reverse(1, 1751));
    EXPECT_TRUE(state.contains("FLDataSeqNum"));
    EXPECT_TRUE(state.contains("RLDataSeqNum"));
}

TEST_F(SystemIdentityTest, ShowsItsRows)
{
    send(identity().put16(184, 12345));
    EXPECT_EQ(row("k1xRoamingHome"), "OFF [0]");
    EXPECT_EQ(row("kSystemId"), "4139");
    EXPECT_EQ(row("kNetworkId"), "65535");
    EXPECT_EQ(row("kPacketZoneId"), "7");
    EXPECT_EQ(row("kBaseId"), "12345");
    EXPECT_EQ(row("kProtocolRevision"), "6");
}

TEST_F(SystemIdentityTest, AnotherSystemTypeIsToldInPlaceOfItsNumbers)
{
    send(identity().put32(46, 3));
    EXPECT_EQ(row("kSystemId"), "(unknown system type 3)");
    EXPECT_EQ(row("kNetworkId"), "(unknown system type 3)");
    send(identity().put32(46, 0xFFFFFFFF));
    EXPECT_EQ(row("kSystemId"), "(unknown system type -1)");
}

TEST_F(SystemIdentityTest, NamesEveryRoamingIndicator)
{
    const std::vector<std::string> kIndicators = {"OFF [0]",
                                                  "ON [1]",
                                                  "Flashing [2]",
                                                  "Out of Neighborhood [3]",
                                                  "Out of Building [4]",
                                                  "Preferred system [5]",
                                                  "Available system [6]",
                                                  "Alliance partner [7]",
                                                  "Premium partner [8]",
                                                  "Full service functionality [9]",
                                                  "Partial service functionality [10]",
                                                  "Banner ON [11]",
                                                  "Banner OFF [12]",
                                                  "ERI - 13"};
    for (unsigned value = 0; value < kIndicators.size(); ++value) {
        send(identity().put32(42, value));
        EXPECT_EQ(row("k1xRoamingHome"), kIndicators[value]);
    }
    send(identity().put32(42, 0xFFFFFFFE));
    EXPECT_EQ(row("k1xRoamingHome"), "ERI - -2");
}

TEST_F(SystemIdentityTest, TheBaseIdIsLeftWhereThePacketEndsBeforeIt)
{
    send(identity().put16(184, 12345));
    send(identity(185).put8(184, 1));
    EXPECT_EQ(row("kBaseId"), "12345");
    send(identity(171).put8(131, 9));
    EXPECT_EQ(row("kBaseId"), "12345");
    EXPECT_EQ(row("kPacketZoneId"), "9");
}

TEST_F(SystemIdentityTest, ShortPacketsAndOldVersionsAreRejected)
{
    send(identity(170));
    send(identity().put8(13, 1));
    EXPECT_THAT(services.log.errors(),
                ElementsAre("Log code 0x134f is 170 bytes long but must be at least 171 bytes.",
                            "Log code 0x134f has version=1; only version 2 or higher expected; "
                            "dropping."));
    EXPECT_EQ(row("kSystemId"), "");
    send(identity().put8(13, 3));
    EXPECT_EQ(row("kSystemId"), "4139");
}

} // namespace orvane
