#pragma once

#include "platform/base/PacketView.h"

#include <cstdint>
#include <optional>

namespace orvane
{

// The shortest packet that carries subpackets: their count is at byte 14, the first starts here.
inline constexpr std::size_t kFirstSubpacket = 17;

// A window from the first byte of the subpacket with the identifier to the packet's end, or
// nothing. A subpacket's byte 0 is its identifier, bytes 2-3 its size. One whose size is bad ends
// the search with an error line.
std::optional<PacketView> findSubpacket(PacketView packet, std::uint8_t identifier);

} // namespace orvane
