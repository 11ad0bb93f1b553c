#pragma once

#include "telephonyd/phone/CDMAPhone.h"
#include "telephonyd/phone/CDMARadio.h"
#include "telephonyd/phone/EvdoTraffic.h"
#include "telephonyd/phone/Scenario.h"

#include <optional>
#include <span>

namespace orvane
{

// The log packets of a CDMA modem's EV-DO half, put together field by field.

constexpr std::uint16_t kEvdoFingersCode = 0x108A;
constexpr std::uint16_t kEvdoSummaryCode = 0x1183;
constexpr std::uint16_t kEvdoForwardTrafficCode = 0x1192;
constexpr std::uint16_t kEvdoReverseTrafficCode = 0x127E;
constexpr std::uint16_t kEvdoActiveSetCode = 0x12B6;

// A finger without a pilot is not locked on anything.
PhoneMessage evdoFingers(std::span<const std::optional<CDMAPilot>> fingers);
// Without a serving pilot where EV-DO is not found.
PhoneMessage evdoSummary(const CDMAPhone& phone, const CDMARadio& radio,
                         std::optional<std::uint16_t> servingPilot);
PhoneMessage evdoActiveSet(std::span<const CDMAPilot> pilots);
// The seconds are those since the counting began.
PhoneMessage evdoForwardTraffic(std::uint32_t seconds, const EvdoForwardTraffic& traffic);
PhoneMessage evdoReverseTraffic(std::uint32_t seconds, const EvdoReverseTraffic& traffic);

} // namespace orvane
