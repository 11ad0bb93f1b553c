#include "telephonyd/phone/PacketWriter.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using testing::ElementsAre;

TEST(PacketWriterTest, WholeFieldsAreLittleEndian)
{
    PacketWriter writer;
    writer.put8(0x1FF).put16(0x1234).put32(0x89ABCDEF).skip(2).append(Bytes{7, 8});
    EXPECT_THAT(writer.take(), ElementsAre(0xFF, 0x34, 0x12, 0xEF, 0xCD, 0xAB, 0x89, 0, 0, 7, 8));
}

TEST(PacketWriterTest, BitsFillAByteFromItsLowestAndGoOnInTheNext)
{
    PacketWriter writer;
    writer.bits(0x1FF, 9).bits(0, 3).bits(0b1011, 4).bits(1, 1);
    EXPECT_THAT(writer.take(), ElementsAre(0xFF, 0b10110001, 0x01));
}

TEST(PacketWriterTest, OnlyTheLowestBitsOfAValueCount)
{
    PacketWriter writer;
    writer.bits(0xFFFFFFFF, 3).bits(0, 0);
    EXPECT_THAT(writer.take(), ElementsAre(0x07));
}

TEST(PacketWriterTest, WholeFieldsBeginAtTheNextByte)
{
    PacketWriter writer;
    writer.bits(1, 1).put8(0xAA).bits(1, 1).skip(1).bits(1, 1).append(Bytes{5}).bits(1, 1);
    EXPECT_THAT(writer.take(), ElementsAre(1, 0xAA, 1, 0, 1, 5, 1));
}

TEST(PacketWriterTest, RawValuesAreTheNearestWithinTheirWidth)
{
    EXPECT_EQ(rawValue(-100, -140, 0.25, 9), 160U);
    EXPECT_EQ(rawValue(-99.9, -140, 0.25, 9), 160U);
    EXPECT_EQ(rawValue(-99.8, -140, 0.25, 9), 161U);
    EXPECT_EQ(rawValue(-141, -140, 0.25, 9), 0U);
    EXPECT_EQ(rawValue(0, -140, 0.25, 9), 511U);
    EXPECT_EQ(rawValue(23, -30, 1, 6), 53U);
}

} // namespace
} // namespace orvane
