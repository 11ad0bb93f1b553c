#pragma once

#include "LogGenerator/Formats.h"

namespace orvane
{

// Tables and formats of the CDMA decoders.

RowText bandClass(std::int64_t raw);
RowText evdoDeviceState(std::int64_t raw);
RowText evdoSessionState(std::int64_t raw);
RowText oneXDeviceState(std::int64_t raw);
// A signed value; what the table lacks shows as "ERI - %d".
RowText roamingIndicator(std::int64_t raw);

// "%+d dBm".
RowText signedDecibelMilliwatts(std::int64_t raw);
// "%+.2f dBm" and "%+.2f dB".
std::string fineDecibelMilliwatts(double value);
std::string fineDecibels(double value);
// "%+.2f dB" of an energy in which 512 is 0 dB; none at all is minus infinity.
std::string decibelsOfEnergy(std::uint64_t energy);

} // namespace orvane
