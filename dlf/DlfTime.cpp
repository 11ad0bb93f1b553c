#include "dlf/DlfTime.h"

#include "platform/base/LogMessage.h"

#include <cmath>
#include <limits>

namespace orvane
{

namespace
{

constexpr double kEpoch = kLogEpochSeconds;
constexpr double kFractionsPerStep = 65536;
constexpr double kSteps = 281474976710656.0; // 2 to the 48th

} // namespace

bool areTimestampsWithin(std::uint64_t steps, std::uint64_t one, std::uint64_t other)
{
    const std::uint64_t a = one >> 16;
    const std::uint64_t b = other >> 16;
    return one < kFirstFutureTimestamp && other < kFirstFutureTimestamp &&
           (a < b ? b - a : a - b) <= steps;
}

double dlfSecondsSince1970(std::uint64_t timestamp)
{
    // The step and its fraction apart: 64 bits in one go would not fit a double.
    const double steps = static_cast<double>(timestamp >> 16);
    const double fraction = static_cast<double>(timestamp & 0xFFFF) / kFractionsPerStep;
    return kEpoch + (steps + fraction) / kDlfStepsPerSecond;
}

std::uint64_t dlfTimestamp(double secondsSince1970)
{
    const double steps = (secondsSince1970 - kEpoch) * kDlfStepsPerSecond;
    if (!(steps > 0))
        return 0;
    if (steps >= kSteps)
        return std::numeric_limits<std::uint64_t>::max();
    // A double of today's date cannot hold a step's fraction exactly: without this, half of the
    // whole steps would come back as the last fractions of the step before.
    const double nearest = std::round(steps);
    const auto whole = static_cast<std::uint64_t>(nearest) << 16;
    if (nearest < kSteps && dlfSecondsSince1970(whole) == secondsSince1970)
        return whole;
    const double floor = std::floor(steps);
    const auto fraction = static_cast<std::uint64_t>((steps - floor) * kFractionsPerStep + 0.5);
    const std::uint64_t base = static_cast<std::uint64_t>(floor) << 16;
    return fraction > std::numeric_limits<std::uint64_t>::max() - base
               ? std::numeric_limits<std::uint64_t>::max()
               : base + fraction;
}

} // namespace orvane
