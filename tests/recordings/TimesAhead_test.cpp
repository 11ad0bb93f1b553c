#include "recordings/TimesAhead.h"

#include "recordings/support/LogFiles.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;

constexpr std::uint64_t kDay = 24 * 3600 * kLogSecond;
constexpr std::uint64_t kWild = std::uint64_t{0x7FFF} << 48;

TimesAhead ahead(const std::vector<std::uint64_t>& timestamps)
{
    LogBuilder log;
    for (const std::uint64_t timestamp : timestamps)
        log.measurement(timestamp, 1);
    return TimesAhead(DlfReader(log.source()));
}

bool allowsLeap(const std::vector<std::uint64_t>& timestamps, std::uint64_t to)
{
    return ahead(timestamps).allowLeap(to, LogClock(kLogStart), 10s);
}

TEST(TimesAheadTest, ALeapFromWhichTimeComesBackIsNone)
{
    const std::uint64_t now = kLogStart + 11 * kLogSecond;
    EXPECT_FALSE(allowsLeap({now, now, now}, kWild));
    EXPECT_FALSE(allowsLeap({now, now, now}, now + 2 * kDay));
    EXPECT_FALSE(allowsLeap({now}, kWild));
    EXPECT_FALSE(allowsLeap({kWild + kDay, now, now}, kWild)) << "two wild ones in a row";
    EXPECT_FALSE(allowsLeap({0, now, 0, 0, now, 0, now}, kWild));
}

TEST(TimesAheadTest, ALeapThatTheNextItemsTakePartInIsOne)
{
    const std::uint64_t later = kLogStart + 400 * kDay;
    EXPECT_TRUE(allowsLeap({later, later + kLogSecond, later}, later));
    EXPECT_TRUE(allowsLeap({later, kLogStart, later}, later));
    EXPECT_TRUE(allowsLeap({later}, later));
}

TEST(TimesAheadTest, TheLastItemMayLeapButNotIntoTheFuture)
{
    EXPECT_TRUE(allowsLeap({}, kLogStart + 400 * kDay));
    EXPECT_FALSE(allowsLeap({}, kWild));
    EXPECT_FALSE(allowsLeap({0, 0}, kWild));
}

TEST(TimesAheadTest, ALogBeginsOnTheDayOfTheNextItems)
{
    EXPECT_TRUE(ahead({kLogStart, kLogStart, kLogStart}).allowStart(kLogStart));
    EXPECT_TRUE(ahead({kWild, kLogStart, kWild}).allowStart(kLogStart));
    EXPECT_FALSE(ahead({kLogStart, kLogStart, kLogStart}).allowStart(kWild));
    EXPECT_FALSE(ahead({kLogStart, kLogStart}).allowStart(kLogSecond)) << "a clock not yet set";
    EXPECT_FALSE(ahead({kWild, kLogStart, kLogStart}).allowStart(kWild)) << "two of them";
}

TEST(TimesAheadTest, WhereTheNextItemsDoNotAgreeALogBeginsAnywhere)
{
    EXPECT_TRUE(ahead({}).allowStart(kWild));
    EXPECT_TRUE(ahead({kLogStart}).allowStart(kWild));
    EXPECT_TRUE(ahead({kLogStart + 2 * kDay, kLogStart + 4 * kDay}).allowStart(kLogStart));
}

TEST(TimesAheadTest, NoMoreThanAFewItemsAreRead)
{
    std::vector<std::uint64_t> timestamps(1000, 0);
    timestamps.push_back(kLogStart);
    timestamps.push_back(kLogStart);
    EXPECT_TRUE(ahead(timestamps).allowStart(kWild)) << "too far away to tell";
}

} // namespace
} // namespace orvane
