#include "recordings/LogTime.h"

#include "platform/base/Calendar.h"
#include "platform/base/LogMessage.h"

#include <algorithm>
#include <cstdio>

namespace orvane
{

namespace
{

using std::chrono::days;
using std::chrono::floor;
using std::chrono::milliseconds;

using Step = std::chrono::duration<std::int64_t, std::ratio<1, 800>>;

constexpr std::chrono::seconds kEpoch{kLogEpochSeconds};
constexpr std::uint64_t kMostSteps =
    static_cast<std::uint64_t>(std::chrono::duration_cast<Step>(LogTime::max() / 2).count());

} // namespace

LogTime LogClock::timeOf(std::uint64_t timestamp) const
{
    const std::uint64_t step = timestamp >> 16;
    const std::uint64_t passed = step > _firstStep ? step - _firstStep : 0;
    return Step(static_cast<std::int64_t>(std::min(passed, kMostSteps)));
}

std::string LogClock::isoText(LogTime time) const
{
    return isoTimeText(millisecondsSince1970(time));
}

std::string LogClock::text(LogTime time) const
{
    const CalendarTime date = calendarTime(millisecondsSince1970(time) / 1000);
    char text[64];
    std::snprintf(text, sizeof text, "%04lld-%02d-%02d %02d:%02d:%02d UTC",
                  static_cast<long long>(date.year), date.month, date.day, date.hour, date.minute,
                  date.second);
    return text;
}

LogTime LogClock::dayOf(LogTime time) const
{
    const milliseconds now{millisecondsSince1970(time)};
    return floor<milliseconds>(time) - (now - floor<days>(now));
}

std::int64_t LogClock::millisecondsSince1970(LogTime time) const
{
    // In quarters of a millisecond, which is what both parts are whole numbers of.
    using Quarter = std::chrono::duration<std::int64_t, std::ratio<1, 4000>>;
    const Quarter first{static_cast<std::int64_t>(_firstStep) * 5};
    return (kEpoch + floor<milliseconds>(first + floor<Quarter>(time))).count();
}

} // namespace orvane
