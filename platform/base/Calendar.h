#pragma once

#include <cstdint>
#include <string>

namespace orvane
{

// A date and time of day in the proleptic Gregorian calendar.
struct CalendarTime {
    std::int64_t year = 1970;
    int month = 1; // 1 to 12
    int day = 1;   // 1 to 31
    int hour = 0;
    int minute = 0;
    int second = 0;
};

// The calendar time of a whole second since 1970, shifted by `secondsFromGmt`.
CalendarTime calendarTime(std::int64_t secondsSince1970, int secondsFromGmt = 0);
// The inverse, in UTC. The fields must be in their ranges.
std::int64_t secondsSince1970(const CalendarTime& time);

// "2026-11-21T10:00:00.000Z"
std::string isoTimeText(std::int64_t millisecondsSince1970);
// "2026-11-21 10:00:00 +0000", always in UTC, fraction dropped.
std::string absoluteDateText(double secondsSince1970);
// The fraction dropped downwards; what is beyond any calendar is cut to its ends.
std::int64_t wholeSeconds(double seconds);

} // namespace orvane
