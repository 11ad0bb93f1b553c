#pragma once

#include <cstdint>

namespace orvane
{

// Timestamps of diagnostic log items: the upper 48 bits count steps of 1.25 ms since 1980-01-06
// 00:00:00 UTC, the lower 16 bits are a fraction of one step (1/65536 each). Leap seconds are not
// applied, neither here nor by those who read the result.

// Whole steps in one second.
constexpr std::uint64_t kDlfStepsPerSecond = 800;
constexpr std::uint64_t kDlfStepsPerDay = 24 * 3600 * kDlfStepsPerSecond;

// Plausible timestamps begin in March 1980: earlier ones are those of a clock that was never set,
// and small numbers are common in payloads. They end in 2150: later ones are the bytes of erased
// blocks.
constexpr std::uint64_t kFirstTimelyTimestamp = std::uint64_t{1} << 48;
constexpr std::uint64_t kFirstFutureTimestamp = std::uint64_t{0x400} << 48;

// Whether two timestamps are no more than so many whole steps apart, and neither lies in the
// future.
[[nodiscard]] bool areTimestampsWithin(std::uint64_t steps, std::uint64_t one, std::uint64_t other);

// Seconds since 1970-01-01 00:00:00 UTC.
[[nodiscard]] double dlfSecondsSince1970(std::uint64_t timestamp);

// The inverse, to the nearest fraction. A time that is a whole step as near as a double can say it
// becomes that step with fraction 0. Times before 1980-01-06, and not-a-number, become 0;
// times beyond the last timestamp become that one.
[[nodiscard]] std::uint64_t dlfTimestamp(double secondsSince1970);

} // namespace orvane
