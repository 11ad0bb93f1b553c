#pragma once

#include "LogGenerator/GSM/LogCodes.h"
#include "LogGenerator/Section.h"

namespace orvane
{

// The packets of the sets that empty their list with every active set packet and never add a cell
// to it. That their lists are always empty is meant.
inline constexpr PacketLayout kAlwaysEmptySetPackets[] = {ownPacket(kUmtsActiveSetCode, 16)};

} // namespace orvane
