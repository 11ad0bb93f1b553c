#include "recordings/TypedTime.h"

#include "platform/base/DecimalNumber.h"

#include <algorithm>
#include <cstdio>
#include <cstring>

namespace orvane
{

namespace
{

using std::chrono::days;
using std::chrono::duration_cast;

constexpr double kMostSeconds = 1e9;

std::optional<LogTime> secondsIn(const std::string& text)
{
    const std::optional<double> seconds = decimalNumber(text);
    if (!seconds || *seconds < 0)
        return std::nullopt;
    return duration_cast<LogTime>(std::chrono::duration<double>(std::min(*seconds, kMostSeconds)));
}

std::optional<LogTime> timeOfDayIn(const std::string& text)
{
    // scanf takes signs and blanks, which no time of the day has.
    if (text.find_first_not_of("0123456789:") != std::string::npos)
        return std::nullopt;
    int hour = 0;
    int minute = 0;
    int second = 0;
    int end = 0;
    if (std::sscanf(text.c_str(), "%2d:%2d%n:%2d%n", &hour, &minute, &end, &second, &end) < 2 ||
        static_cast<std::size_t>(end) != text.size() || hour > 23 || minute > 59 || second > 59)
        return std::nullopt;
    return std::chrono::hours(hour) + std::chrono::minutes(minute) + std::chrono::seconds(second);
}

} // namespace

std::optional<LogTime> typedTime(const std::string& text, const LogClock& clock, LogTime position,
                                 LogTime duration)
{
    if (text.starts_with('+')) {
        const auto seconds = secondsIn(text.substr(1));
        return seconds ? std::optional(std::min(*seconds, duration)) : std::nullopt;
    }
    const auto timeOfDay = timeOfDayIn(text);
    if (!timeOfDay)
        return std::nullopt;
    const auto inside = [duration](LogTime time) { return std::clamp(time, LogTime(0), duration); };
    const auto outside = [inside](LogTime time) {
        return time > inside(time) ? time - inside(time) : inside(time) - time;
    };
    const LogTime today = clock.dayOf(position) + *timeOfDay;
    LogTime best = today;
    for (const LogTime other : {today - days(1), today + days(1)})
        if (outside(other) < outside(best))
            best = other;
    return inside(best);
}

} // namespace orvane
