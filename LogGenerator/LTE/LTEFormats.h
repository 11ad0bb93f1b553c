#pragma once

#include "LogGenerator/Field.h"

namespace orvane
{

// How LTE packets carry levels: the raw number, in steps of a fraction of a decibel, above a lowest
// level. Each has its value in decibels and its format, "%4.2f dBm" or "%4.2f dB".

constexpr double quarterDecibelPower(std::int64_t raw)
{
    return static_cast<double>(raw) * 0.25 - 140.0;
}
constexpr double halfDecibelPower(std::int64_t raw)
{
    return static_cast<double>(raw) * 0.5 - 140.0;
}
constexpr double eighthDecibelQuality(std::int64_t raw)
{
    return static_cast<double>(raw) * 0.125 - 20.0;
}
constexpr double quarterDecibelQuality(std::int64_t raw)
{
    return static_cast<double>(raw) * 0.25 - 30.0;
}

RowText rsrpQuarterDb(std::int64_t raw);
RowText rsrpHalfDb(std::int64_t raw);
RowText rsrqEighthDb(std::int64_t raw);
RowText rsrqQuarterDb(std::int64_t raw);
RowText rssiHalfDb(std::int64_t raw);

// raw - 30, "%d dBm".
RowText minus30(std::int64_t raw);
// The lowest level at which a cell may be chosen: 2 * raw - 140, "%d dBm".
RowText qrxlevmin(std::int64_t raw);

} // namespace orvane
