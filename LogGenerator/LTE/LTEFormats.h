#pragma once

#include "LogGenerator/Formats.h"

namespace orvane
{

// How LTE packets carry levels: the raw number, in steps of a fraction of a decibel, above a lowest
// level. Shown by "%4.2f dBm" and "%4.2f dB".
inline constexpr Format rsrpQuarterDb = fixedFormat({.factor = 0.25, .offset = -140.0}, 2, " dBm");
inline constexpr Format rsrpHalfDb = fixedFormat({.factor = 0.5, .offset = -140.0}, 2, " dBm");
inline constexpr Format rsrqEighthDb = fixedFormat({.factor = 0.125, .offset = -20.0}, 2, " dB");
inline constexpr Format rsrqQuarterDb = fixedFormat({.factor = 0.25, .offset = -30.0}, 2, " dB");
inline constexpr Format rssiHalfDb = fixedFormat({.factor = 0.5, .offset = -140.0}, 2, " dBm");
// raw - 30, "%d dBm".
inline constexpr Format minus30 = wholeFormat(" dBm", {.offset = -30});
// The lowest level at which a cell may be chosen: 2 * raw - 140, "%d dBm".
inline constexpr Format qrxlevmin = wholeFormat(" dBm", {.factor = 2, .offset = -140});

} // namespace orvane
