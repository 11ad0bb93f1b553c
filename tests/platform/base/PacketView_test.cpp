#include "platform/base/PacketView.h"

#include <gtest/gtest.h>

#include <limits>

namespace orvane
{

namespace
{

constexpr std::size_t kHuge = std::numeric_limits<std::size_t>::max();
const Bytes kBytes = {0x01, 0x23, 0x45, 0x67, 0x89, 0xAB, 0xCD, 0xEF};

} // namespace

TEST(PacketViewTest, ReadsLittleEndianAtAnyAlignment)
{
    const PacketView packet(kBytes);
    EXPECT_EQ(packet.unsignedAt(0, 1), 0x01U);
    EXPECT_EQ(packet.unsignedAt(1, 2), 0x4523U);
    EXPECT_EQ(packet.unsignedAt(3, 3), 0xAB8967U);
    EXPECT_EQ(packet.unsignedAt(3, 4), 0xCDAB8967U);
    EXPECT_EQ(packet.unsignedAt(0, 8), 0xEFCDAB8967452301U);
}

TEST(PacketViewTest, WhatReachesPastTheEndIsNotThere)
{
    const PacketView packet(kBytes);
    EXPECT_EQ(packet.unsignedAt(7, 1), 0xEFU);
    EXPECT_EQ(packet.unsignedAt(8, 1), std::nullopt);
    EXPECT_EQ(packet.unsignedAt(7, 2), std::nullopt);
    EXPECT_EQ(packet.unsignedAt(kHuge, 1), std::nullopt);
    EXPECT_EQ(packet.unsignedAt(kHuge - 1, 4), std::nullopt);
    EXPECT_EQ(packet.bitsAt(7, 1, 8), std::nullopt);
    EXPECT_EQ(packet.bitsAt(7, 0, 8), 0xEFU);
    EXPECT_EQ(PacketView(ByteView()).unsignedAt(0, 1), std::nullopt);
}

TEST(PacketViewTest, HoldsCountsBytesWithoutWrapping)
{
    const PacketView packet(kBytes);
    EXPECT_TRUE(packet.holds(0, 8));
    EXPECT_TRUE(packet.holds(8, 0));
    EXPECT_FALSE(packet.holds(0, 9));
    EXPECT_FALSE(packet.holds(9, 0));
    EXPECT_FALSE(packet.holds(4, kHuge));
    EXPECT_FALSE(packet.holds(kHuge, 4));
}

TEST(PacketViewTest, BitFieldsGoOnInTheNextBytesLowBits)
{
    const PacketView packet(kBytes);
    EXPECT_EQ(packet.bitsAt(1, 0, 1), 1U);
    EXPECT_EQ(packet.bitsAt(1, 2, 1), 0U);
    EXPECT_EQ(packet.bitsAt(1, 4, 8), 0x52U);
    EXPECT_EQ(packet.bitsAt(0, 0, 9), 0x101U);
    EXPECT_EQ(packet.bitsAt(0, 0, 32), 0x67452301U);
    EXPECT_EQ(packet.bitsAt(0, 7, 32), 0x12CE8A46U); // five bytes
}

TEST(PacketViewTest, AWindowFromPastTheEndIsEmpty)
{
    const PacketView packet(kBytes);
    EXPECT_EQ(packet.from(0).size(), 8U);
    EXPECT_EQ(packet.from(6).unsignedAt(0, 2), 0xEFCDU);
    EXPECT_EQ(packet.from(8).size(), 0U);
    EXPECT_EQ(packet.from(9).size(), 0U);
    EXPECT_EQ(packet.from(kHuge).size(), 0U);
    EXPECT_EQ(packet.from(6).from(1).bytes().size(), 1U);
}

} // namespace orvane
