#include "platform/Clock.h"

#include <chrono>
#include <cmath>
#include <cstdio>
#include <ctime>

namespace orvane
{

namespace
{

constexpr std::int64_t kSecondsADay = 86400;

// Far beyond any year that can be shown, and safe to compute with.
constexpr double kFarthestSecond = 1e15;

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

double RealClock::secondsSince1970() const
{
    using namespace std::chrono;
    return duration<double>(system_clock::now().time_since_epoch()).count();
}

TimeZone RealClock::timeZoneAt(double secondsSince1970) const
{
    const auto time = static_cast<std::time_t>(wholeSeconds(secondsSince1970));
    std::tm local{};
    if (localtime_r(&time, &local) == nullptr)
        return {};
    return {static_cast<int>(local.tm_gmtoff), local.tm_isdst > 0};
}

CalendarTime calendarTime(std::int64_t secondsSince1970, int secondsFromGmt)
{
    const std::int64_t seconds = secondsSince1970 + secondsFromGmt;
    std::int64_t days = seconds / kSecondsADay;
    std::int64_t rest = seconds % kSecondsADay;
    if (rest < 0) {
        rest += kSecondsADay;
        --days;
    }
    // Days are counted from 0000-03-01, so that the leap day is the last of its year, in eras of
    // 400 years (146097 days).
    days += 719468;
    const std::int64_t era = (days >= 0 ? days : days - 146096) / 146097;
    const std::int64_t dayOfEra = days - era * 146097;
    const std::int64_t yearOfEra =
        (dayOfEra - dayOfEra / 1460 + dayOfEra / 36524 - dayOfEra / 146096) / 365;
    const std::int64_t dayOfYear = dayOfEra - (365 * yearOfEra + yearOfEra / 4 - yearOfEra / 100);
    const std::int64_t monthFromMarch = (5 * dayOfYear + 2) / 153;

    CalendarTime time;
    time.day = static_cast<int>(dayOfYear - (153 * monthFromMarch + 2) / 5 + 1);
    time.month = static_cast<int>(monthFromMarch < 10 ? monthFromMarch + 3 : monthFromMarch - 9);
    time.year = yearOfEra + era * 400 + (time.month <= 2 ? 1 : 0);
    time.hour = static_cast<int>(rest / 3600);
    time.minute = static_cast<int>(rest / 60 % 60);
    time.second = static_cast<int>(rest % 60);
    return time;
}

std::int64_t secondsSince1970(const CalendarTime& time)
{
    const std::int64_t year = time.year - (time.month <= 2 ? 1 : 0);
    const std::int64_t era = (year >= 0 ? year : year - 399) / 400;
    const std::int64_t yearOfEra = year - era * 400;
    const std::int64_t monthFromMarch = time.month > 2 ? time.month - 3 : time.month + 9;
    const std::int64_t dayOfYear = (153 * monthFromMarch + 2) / 5 + time.day - 1;
    const std::int64_t dayOfEra = yearOfEra * 365 + yearOfEra / 4 - yearOfEra / 100 + dayOfYear;
    const std::int64_t days = era * 146097 + dayOfEra - 719468;
    const std::int64_t minutes = std::int64_t{time.hour} * 60 + time.minute;
    return days * kSecondsADay + minutes * 60 + time.second;
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
