#pragma once

#include "telephonyd/phone/Scenario.h"
#include "telephonyd/phone/UMTSTown.h"

#include <span>

namespace orvane
{

// Log packets of a GSM modem about its radio.

constexpr std::uint16_t kGSMServingCellCode = 0x5134;
constexpr std::uint16_t kGSMMeasurementCode = 0x5137;
constexpr std::uint16_t kGSMColoursCode = 0x51FF;
constexpr std::uint16_t kGSMDedicatedChannelCode = 0x5076;
constexpr std::uint16_t kGSMDiscontinuousCode = 0x5072;
constexpr std::uint16_t kGSMRadioStateCode = 0x512C;
constexpr std::uint16_t kGSMMobileAllocationCode = 0x51F8;
constexpr std::uint16_t kGPRSPositionCode = 0x51F4;
constexpr std::uint16_t kGPRSNetworkControlCode = 0x51F5;
constexpr std::uint16_t kGPRSCellOptionsCode = 0x51F6;
constexpr std::uint16_t kGPRSBroadcastCode = 0x51FB;
constexpr std::uint16_t kGPRSMeasurementOrderCode = 0x51FD;

enum class GSMRadioState : std::uint8_t {
    Inactive = 0,
    Idle = 5,
    Reselection = 6,
    ConnectionPending = 7,
    DataTransfer = 9,
    ConnectionRelease = 11,
    ComingFromUMTS = 14,
    GoingToUMTS = 18,
};

struct GSMLevel {
    UMTSTownCell cell;
    double power; // dBm
};

PhoneMessage gsmServingCell(const UMTSTownCell& cell);
// At most 255 neighbours each.
PhoneMessage gsmMeasurement(const GSMLevel& serving, std::span<const GSMLevel> neighbours);
PhoneMessage gsmColours(std::span<const GSMLevel> neighbours);
PhoneMessage gsmRadioState(GSMRadioState state, bool isData);
// The channels among which a call in the cell hops, and the one that it begins on.
PhoneMessage gsmMobileAllocation(const UMTSTownCell& cell);
PhoneMessage gsmDedicatedChannel(const UMTSTownCell& cell);
PhoneMessage gsmDiscontinuousTransmission(bool isUsed);
// What the cell tells about its packet service: one packet each.
std::vector<PhoneMessage> gprsInformation(const UMTSTownCell& cell);

} // namespace orvane
