#pragma once

#include "platform/base/PacketView.h"

namespace orvane
{

// The packet that two sections read: records of transport channels, then, at a distance, records of
// the coded composite transport channels (CCTrCH) that they are part of.

constexpr std::uint32_t kUtranTransportChannelsCode = 0xD00C;
constexpr std::size_t kUtranTransportChannelsBytes = 17; // at least

inline std::size_t transportChannelCount(PacketView packet)
{
    return packet.bitsAt(14, 6, 6).value_or(0);
}
inline std::size_t compositeChannelCount(PacketView packet)
{
    return packet.bitsAt(15, 4, 4).value_or(0);
}
// Deliberate: 17 times what stands before it, not right behind the transport channels.
inline std::size_t firstCompositeChannel(PacketView packet)
{
    return 17 * (17 + 2 * transportChannelCount(packet));
}

} // namespace orvane
