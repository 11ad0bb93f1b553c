#pragma once

#include "LogGenerator/GSM/LogCodes.h"
#include "LogGenerator/Section.h"

namespace orvane
{

// The packets of the sets that empty their list with every active set packet. Deliberate: they
// never add a cell to it.
inline constexpr PacketLayout kAlwaysEmptySetPackets[] = {ownPacket(kUmtsActiveSetCode, 16)};

} // namespace orvane
