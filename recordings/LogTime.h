#pragma once

#include <chrono>
#include <cstdint>
#include <string>

namespace orvane
{

// Time of a recording since its first item. What lies more than 146 years ahead counts as 146
// years, so that sums of two are safe.
using LogTime = std::chrono::nanoseconds;

// The clock of a recording: what LogTime 0 is. Of a timestamp only the whole steps of 1.25 ms count
// (see dlf/DlfTime.h), as UTC without leap seconds.
class LogClock
{
public:
    LogClock() = default;
    explicit LogClock(std::uint64_t firstTimestamp) : _firstStep(firstTimestamp >> 16) {}

    // 0 for timestamps before the first.
    [[nodiscard]] LogTime timeOf(std::uint64_t timestamp) const;
    // "2026-11-21T10:00:00.000Z"
    [[nodiscard]] std::string isoText(LogTime time) const;
    // "2026-11-21 10:00:00 UTC"
    [[nodiscard]] std::string text(LogTime time) const;
    // The beginning of the day that `time` is in, by this clock; may lie before 0.
    [[nodiscard]] LogTime dayOf(LogTime time) const;
    [[nodiscard]] std::int64_t millisecondsSince1970(LogTime time) const;

private:
    std::uint64_t _firstStep = 0;
};

} // namespace orvane
