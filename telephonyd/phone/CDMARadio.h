#pragma once

#include <algorithm>
#include <cmath>
#include <cstdint>

namespace orvane
{

// A pilot and its strength as received, in dB.
struct CDMAPilot {
    std::uint16_t pilotOffset;
    double strength;
};

// What a phone receives and sends on a carrier, in dBm.
struct CDMARadio {
    std::uint8_t band;
    std::uint16_t channel;
    double received;
    double receivedBySecond; // receiver
    double sent;
};

// The whole number nearest to (level - zero) / step, kept within that many bits with its sign: how
// a level becomes the raw value of a signed field.
inline std::uint32_t signedRawValue(double level, double zero, double step, unsigned width)
{
    const double most = std::exp2(width - 1) - 1;
    const double steps = std::clamp(std::round((level - zero) / step), -most - 1, most);
    return static_cast<std::uint32_t>(static_cast<std::int32_t>(steps));
}

} // namespace orvane
