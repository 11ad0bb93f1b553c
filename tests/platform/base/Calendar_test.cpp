#include "platform/base/Calendar.h"

#include <cmath>
#include <gtest/gtest.h>
#include <limits>

namespace orvane
{
namespace
{

std::string textOf(const CalendarTime& time)
{
    char text[64];
    std::snprintf(text, sizeof text, "%lld-%02d-%02d %02d:%02d:%02d",
                  static_cast<long long>(time.year), time.month, time.day, time.hour, time.minute,
                  time.second);
    return text;
}

TEST(CalendarTest, CalendarTimesAreRight)
{
    struct Case {
        std::int64_t seconds;
        const char* text;
    };
    for (const auto& [seconds, text] : {
             Case{0,            "1970-01-01 00:00:00"},
             Case{-1,           "1969-12-31 23:59:59"},
             Case{86399,        "1970-01-01 23:59:59"},
             Case{315964800,    "1980-01-06 00:00:00"},
             Case{951782399,    "2000-02-28 23:59:59"},
             Case{951782400,    "2000-02-29 00:00:00"},
             Case{951868800,    "2000-03-01 00:00:00"},
             Case{978307200,    "2001-01-01 00:00:00"},
             Case{1709164800,   "2024-02-29 00:00:00"},
             Case{1795255200,   "2026-11-21 10:00:00"},
             Case{2147483648,   "2038-01-19 03:14:08"},
             Case{4107542399,   "2100-02-28 23:59:59"}, // no leap year
             Case{4107542400,   "2100-03-01 00:00:00"},
             Case{-2203891200,  "1900-03-01 00:00:00"},
             Case{-2203891201,  "1900-02-28 23:59:59"}, // nor this
             Case{-62135596800, "1-01-01 00:00:00"   },
             Case{-62167219200, "0-01-01 00:00:00"   },
             Case{-62162035201, "0-02-29 23:59:59"   },
             Case{-62167219201, "-1-12-31 23:59:59"  },
             Case{253402300799, "9999-12-31 23:59:59"},
    }) {
        const CalendarTime time = calendarTime(seconds);
        EXPECT_EQ(textOf(time), text);
        EXPECT_EQ(secondsSince1970(time), seconds) << text;
    }
}

TEST(CalendarTest, EveryDayFollowsTheDayBefore)
{
    constexpr std::int64_t kDay = 86400;
    // Two eras of 400 years around 1970, by the rules of the calendar.
    const int days[] = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    CalendarTime expected{1600, 1, 1, 12, 34, 56};
    std::int64_t seconds = secondsSince1970(expected);
    while (expected.year < 2401) {
        ASSERT_EQ(textOf(calendarTime(seconds)), textOf(expected));
        const bool isLeap =
            expected.year % 4 == 0 && (expected.year % 100 != 0 || expected.year % 400 == 0);
        const int last = expected.month == 2 && isLeap ? 29 : days[expected.month - 1];
        if (++expected.day > last) {
            expected.day = 1;
            expected.year += expected.month == 12 ? 1 : 0;
            expected.month = expected.month == 12 ? 1 : expected.month + 1;
        }
        seconds += kDay;
    }
}

TEST(CalendarTest, ShiftIntoAZoneMayChangeTheDay)
{
    EXPECT_EQ(textOf(calendarTime(1795255200, 3600)), "2026-11-21 11:00:00");
    EXPECT_EQ(textOf(calendarTime(1795255200, 14 * 3600)), "2026-11-22 00:00:00");
    EXPECT_EQ(textOf(calendarTime(1795255200, -36001)), "2026-11-20 23:59:59");
    EXPECT_EQ(textOf(calendarTime(0, -1)), "1969-12-31 23:59:59");
}

TEST(CalendarTest, AbsoluteTextIsInUtcWithoutFraction)
{
    struct Case {
        double seconds;
        const char* text;
    };
    for (const auto& [seconds, text] : {
             Case{1795255200,     "2026-11-21 10:00:00 +0000" },
             Case{1795255200.999, "2026-11-21 10:00:00 +0000" },
             Case{-0.001,         "1969-12-31 23:59:59 +0000" },
             Case{-62135596800,   "0001-01-01 00:00:00 +0000" },
             Case{253402300800,   "10000-01-01 00:00:00 +0000"},
    })
        EXPECT_EQ(absoluteDateText(seconds), text);
}

TEST(CalendarTest, AbsoluteTextOfAnySecondHasItsForm)
{
    const double infinity = std::numeric_limits<double>::infinity();
    // Times beyond the calendar are cut to its ends.
    EXPECT_EQ(absoluteDateText(std::nan("")), "1970-01-01 00:00:00 +0000");
    EXPECT_EQ(absoluteDateText(infinity), absoluteDateText(1e15));
    EXPECT_EQ(absoluteDateText(1e300), absoluteDateText(1e15));
    EXPECT_EQ(absoluteDateText(-infinity), absoluteDateText(-1e15));
    EXPECT_TRUE(absoluteDateText(infinity).ends_with(" +0000"));
}

} // namespace
} // namespace orvane
