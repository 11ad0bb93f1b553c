#include "platform/base/Calendar.h"

#include <chrono>
#include <cmath>
#include <cstdio>

namespace orvane
{

namespace
{

// Far beyond any year that can be shown, and safe to compute with.
constexpr double kFarthestSecond = 1e15;

// The calendar repeats every 400 years. The years of std::chrono end at 32767: longer spans are
// counted in whole eras beside it.
constexpr std::int64_t kYearsPerEra = 400;
constexpr std::chrono::days kEra{146097};

} // namespace

std::int64_t wholeSeconds(double seconds)
{
    if (std::isnan(seconds))
        return 0;
    if (seconds > kFarthestSecond)
        seconds = kFarthestSecond;
    if (seconds < -kFarthestSecond)
        seconds = -kFarthestSecond;
    return static_cast<std::int64_t>(std::floor(seconds));
}

CalendarTime calendarTime(std::int64_t secondsSince1970, int secondsFromGmt)
{
    using namespace std::chrono;
    const seconds local{secondsSince1970 + secondsFromGmt};
    const auto day = floor<days>(local);
    const auto era = day.count() / kEra.count();
    const year_month_day date{sys_days(day % kEra)};
    const hh_mm_ss<seconds> time(local - day);
    return {int{date.year()} + era * kYearsPerEra,    static_cast<int>(unsigned{date.month()}),
            static_cast<int>(unsigned{date.day()}),   static_cast<int>(time.hours().count()),
            static_cast<int>(time.minutes().count()), static_cast<int>(time.seconds().count())};
}

std::int64_t secondsSince1970(const CalendarTime& time)
{
    using namespace std::chrono;
    const std::int64_t era = time.year / kYearsPerEra;
    const year_month_day date(year(static_cast<int>(time.year % kYearsPerEra)),
                              month(static_cast<unsigned>(time.month)),
                              day(static_cast<unsigned>(time.day)));
    const days since1970 = sys_days(date).time_since_epoch() + era * kEra;
    return seconds(since1970).count() + seconds(hours(time.hour)).count() +
           seconds(minutes(time.minute)).count() + time.second;
}

std::string isoTimeText(std::int64_t millisecondsSince1970)
{
    using namespace std::chrono;
    const milliseconds time{millisecondsSince1970};
    const auto whole = floor<seconds>(time);
    const CalendarTime date = calendarTime(whole.count());
    char text[64];
    std::snprintf(text, sizeof text, "%04lld-%02d-%02dT%02d:%02d:%02d.%03dZ",
                  static_cast<long long>(date.year), date.month, date.day, date.hour, date.minute,
                  date.second, static_cast<int>((time - whole).count()));
    return text;
}

std::string absoluteDateText(double seconds)
{
    const CalendarTime time = calendarTime(wholeSeconds(seconds));
    char text[64];
    std::snprintf(text, sizeof text, "%04lld-%02d-%02d %02d:%02d:%02d +0000",
                  static_cast<long long>(time.year), time.month, time.day, time.hour, time.minute,
                  time.second);
    return text;
}

} // namespace orvane
