#include "recordings/LogTime.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

constexpr std::uint64_t kStep = std::uint64_t{1} << 16;
// 2026-11-21 10:00:00 UTC, in steps since 1980-01-06.
constexpr std::uint64_t kMorning = (1795255200ULL - 315964800ULL) * 800 * kStep;

TEST(LogTimeTest, StepsOfATimestampAreOneAndAQuarterMilliseconds)
{
    const LogClock clock(kMorning);
    EXPECT_EQ(clock.timeOf(kMorning), 0ns);
    EXPECT_EQ(clock.timeOf(kMorning + kStep), 1250us);
    EXPECT_EQ(clock.timeOf(kMorning + 800 * kStep), 1s);
}

TEST(LogTimeTest, FractionsOfAStepDoNotCount)
{
    const LogClock clock(kMorning + kStep - 1);
    EXPECT_EQ(clock.timeOf(kMorning + kStep + 5), 1250us);
    EXPECT_EQ(clock.isoText(0ns), "2026-11-21T10:00:00.000Z");
}

TEST(LogTimeTest, EarlierTimestampsAndNoneAreTheFirstMoment)
{
    const LogClock clock(kMorning);
    EXPECT_EQ(clock.timeOf(kMorning - kStep), 0ns);
    EXPECT_EQ(clock.timeOf(0), 0ns);
}

TEST(LogTimeTest, FarTimestampsCountAsTheFarthestTime)
{
    const LogClock clock(0);
    EXPECT_GT(clock.timeOf(UINT64_MAX), 146 * 365 * 24h);
    EXPECT_LE(clock.timeOf(UINT64_MAX), LogTime::max() / 2);
    EXPECT_EQ(clock.timeOf(UINT64_MAX), clock.timeOf(UINT64_MAX / 2));
}

TEST(LogTimeTest, TimesAreShownInUtc)
{
    const LogClock clock(kMorning + 3 * kStep); // 3.75 ms
    EXPECT_EQ(clock.isoText(0ns), "2026-11-21T10:00:00.003Z");
    EXPECT_EQ(clock.isoText(1250us), "2026-11-21T10:00:00.005Z");
    EXPECT_EQ(clock.isoText(59s + 996ms), "2026-11-21T10:00:59.999Z");
    EXPECT_EQ(clock.isoText(14h), "2026-11-22T00:00:00.003Z");
    EXPECT_EQ(clock.text(14h), "2026-11-22 00:00:00 UTC");
    EXPECT_EQ(LogClock().isoText(0ns), "1980-01-06T00:00:00.000Z");
    EXPECT_EQ(LogClock(UINT64_MAX).isoText(0ns), "13129-07-01T06:54:48.318Z");
}

TEST(LogTimeTest, DaysBeginAtMidnight)
{
    const LogClock clock(kMorning);
    EXPECT_EQ(clock.dayOf(0s), -10h);
    EXPECT_EQ(clock.dayOf(13h + 59min), -10h);
    EXPECT_EQ(clock.dayOf(14h), 14h);
}

} // namespace
} // namespace orvane
