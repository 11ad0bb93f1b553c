#include "recordings/TypedTime.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

// Begins at 2017-07-11 04:34:08 UTC.
const LogClock kClock(std::uint64_t{1183782848} * 800 << 16);

std::optional<LogTime> typed(const std::string& text, LogTime position = 0s,
                             LogTime duration = 300s)
{
    return typedTime(text, kClock, position, duration);
}

TEST(TypedTimeTest, SecondsCountFromTheStart)
{
    EXPECT_EQ(typed("+90"), 90s);
    EXPECT_EQ(typed("+0.5"), 500ms);
    EXPECT_EQ(typed("+90", 200s), 90s);
    EXPECT_EQ(typed("+1000"), 300s);
    EXPECT_EQ(typed("+1e300"), 300s);
}

TEST(TypedTimeTest, TimesOfTheDayAreTheRecordingsOwn)
{
    EXPECT_EQ(typed("04:34:08"), 0s);
    EXPECT_EQ(typed("4:35:00"), 52s);
    EXPECT_EQ(typed("04:35"), 52s);
}

TEST(TypedTimeTest, TimesOutsideOfTheRecordingAreItsNearerEnd)
{
    EXPECT_EQ(typed("04:30"), 0s);
    EXPECT_EQ(typed("04:50"), 300s);
    EXPECT_EQ(typed("23:59"), 0s);
    EXPECT_EQ(typed("12:00"), 300s);
}

TEST(TypedTimeTest, TimesAreOfTheDayThatIsShownOrElseOfAnother)
{
    // Three days long.
    EXPECT_EQ(typed("04:34:10", 1h, 72h), 2s);
    EXPECT_EQ(typed("04:34:10", 25h, 72h), 24h + 2s);
    EXPECT_EQ(typed("04:34:00", 1h, 72h), 24h - 8s);
    EXPECT_EQ(typed("00:10", 21h, 22h), 20h - 24h + 23h + 35min + 52s);
    EXPECT_EQ(typed("23:59", 21h, 22h), 19h + 24min + 52s);
}

TEST(TypedTimeTest, OtherTextsAreNoTimes)
{
    for (const char* text :
         {"", "+", "+x", "+-3", "-3", "90", "10", "10:", "10:4:", "24:00", "10:60", "10:00:60",
          "10:00:00:00", "10:00 ", " 10:00", "-1:00", "1:-1", "+inf", "123:00"})
        EXPECT_FALSE(typed(text)) << text;
}

} // namespace
} // namespace orvane
