#include "LogGenerator/C2K/Subpackets.h"

#include "platform/services/SystemLog.h"

namespace orvane
{

namespace
{

constexpr std::size_t kCountOffset = 14;
constexpr std::size_t kSubpacketHeaderBytes = 4;

} // namespace

std::optional<PacketView> findSubpacket(PacketView packet, std::uint8_t identifier)
{
    const auto count = packet.unsignedAt(kCountOffset, 1).value_or(0);
    std::size_t start = kFirstSubpacket;
    for (unsigned i = 0; i < count && packet.holds(start, kSubpacketHeaderBytes); ++i) {
        const PacketView subpacket = packet.from(start);
        const auto size = subpacket.unsignedAt(2, 2).value_or(0);
        // Deliberate: measured from the first subpacket, not from the packet's end.
        if (start + size >= kFirstSubpacket + packet.size()) {
            logError("Log code error in subpkt#%d: bad size (%d).", static_cast<int>(i),
                     static_cast<int>(size));
            return std::nullopt;
        }
        if (subpacket.unsignedAt(0, 1) == identifier)
            return subpacket;
        start += size;
    }
    return std::nullopt;
}

} // namespace orvane
