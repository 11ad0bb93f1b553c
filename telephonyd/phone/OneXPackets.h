#pragma once

#include "telephonyd/phone/CDMAPhone.h"
#include "telephonyd/phone/CDMARadio.h"
#include "telephonyd/phone/CDMATown.h"
#include "telephonyd/phone/Scenario.h"

#include <span>

namespace orvane
{

// The log packets of a CDMA modem's 1x half, put together field by field.

constexpr std::uint16_t kOneXStatusCode = 0x119C;
constexpr std::uint16_t kOneXFrameCode = 0x119D;
constexpr std::uint16_t kOneXSystemCode = 0x134F;

PhoneMessage oneXStatus(OneXState state, const CDMARadio& radio, std::span<const CDMAPilot> pilots,
                        std::uint16_t referencePilot);
// A frame of voice.
PhoneMessage oneXFrame(bool isDamaged);
PhoneMessage oneXSystem(const CDMACell& cell);

} // namespace orvane
