#include "LogGenerator/C2K/C2KDecoders.h"
#include "LogGenerator/C2K/C2KFormats.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/SystemLog.h"

// The 1x system identity packet.

namespace orvane
{

namespace
{

// The base id lies beyond the shortest packet: in one that ends before it, its row stays.
constexpr std::size_t kMinimumBytes = 171;
constexpr std::uint64_t kFirstVersion = 2;
constexpr std::int64_t kCdmaSystem = 2;

constexpr Field kFields[] = {
    bytesField("k1xRoamingHome", 42, 4, roamingIndicator, Coding::Signed),
    bytesField("kPacketZoneId", 131, 1, decimal),
    bytesField("kBaseId", 184, 2, decimal),
    bytesField("kProtocolRevision", 133, 1, decimal),
};

// Shown for one type of system only.
constexpr Field kCdmaFields[] = {
    bytesField("kSystemId", 50, 2, decimal),
    bytesField("kNetworkId", 52, 2, decimal),
};

} // namespace

void decodeSystemIdentity(PacketView packet, PropertyDictionary&, const C2KPublisher& publisher)
{
    if (packet.size() < kMinimumBytes) {
        logError("Log code 0x134f is %d bytes long but must be at least %lu bytes.",
                 static_cast<int>(packet.size()), static_cast<unsigned long>(kMinimumBytes));
        return;
    }
    const auto version = packet.unsignedAt(13, 1).value_or(0);
    if (version < kFirstVersion) {
        logError("Log code 0x134f has version=%d; only version 2 or higher expected; dropping.",
                 static_cast<int>(version));
        return;
    }
    publisher.publish(packet, kFields);
    const auto systemType = static_cast<std::int64_t>(packet.unsignedAt(46, 4).value_or(0));
    if (systemType == kCdmaSystem)
        publisher.publish(packet, kCdmaFields);
    else
        publisher.publishText(
            printed("(unknown system type %d)", static_cast<std::int32_t>(systemType)).c_str(),
            kCdmaFields);
}

} // namespace orvane
