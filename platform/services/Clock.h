#pragma once

#include "platform/base/Calendar.h"

namespace orvane
{

// The local time zone at some moment.
struct TimeZone {
    int secondsFromGmt = 0; // east is positive
    bool isDaylightSaving = false;
};

// Wall-clock time and the local time zone.
class Clock
{
public:
    virtual ~Clock() = default;
    // Seconds since 1970-01-01 00:00:00 UTC, with fraction.
    [[nodiscard]] virtual double secondsSince1970() const = 0;
    [[nodiscard]] virtual TimeZone timeZoneAt(double secondsSince1970) const = 0;
};

// This machine's clock and zone.
class RealClock final : public Clock
{
public:
    [[nodiscard]] double secondsSince1970() const override;
    [[nodiscard]] TimeZone timeZoneAt(double secondsSince1970) const override;
};

} // namespace orvane
