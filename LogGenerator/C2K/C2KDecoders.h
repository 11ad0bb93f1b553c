#pragma once

#include "LogGenerator/C2K/C2KPublisher.h"
#include "platform/base/PacketView.h"
#include "platform/base/PropertyValue.h"

#include <cstdint>
#include <span>

namespace orvane
{

// The decoders of the CDMA 1x and 1xEV-DO packets. Each is given the unframed packet, header
// included, the generator's state (some keep figures there from one packet to the next) and where
// to publish. One that rejects a packet logs why and publishes nothing.
struct C2KDecoder {
    std::uint32_t logCode;
    void (*decode)(PacketView packet, PropertyDictionary& state, const C2KPublisher& publisher);
};

// In the order in which the start command asks for their codes.
std::span<const C2KDecoder> c2kDecoders();

using C2KDecode = void(PacketView packet, PropertyDictionary& state, const C2KPublisher& publisher);

C2KDecode decodeEvdoSummary;     // 0x1183
C2KDecode decodeEvdoActiveSet;   // 0x12B6
C2KDecode decodeFingers;         // 0x108A
C2KDecode decodeOneXStatus;      // 0x119C
C2KDecode decodeTrafficErrors;   // 0x119D
C2KDecode decodeForwardDataRate; // 0x1192
C2KDecode decodeReverseDataRate; // 0x127E
C2KDecode decodeSystemIdentity;  // 0x134F

// The state key that both 0x119C and 0x119D use: the moving average of frame errors, 0 to 1.
inline constexpr const char* kTrafficErrorsKey = "TrafficFER";

// An empty dictionary whose rows the display tree keeps in their order.
PropertyValue newSortedRows();

} // namespace orvane
