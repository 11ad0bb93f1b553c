#pragma once

#include <cstdint>

namespace orvane
{

// A gain control reading (tenths of a decibel from -51.2 dB on) in whole decibels, cut towards
// zero, before the offset of the receiver or transmitter.
constexpr std::int64_t gainControlDecibels(std::int64_t reading) { return (reading + 512) / 10; }

} // namespace orvane
