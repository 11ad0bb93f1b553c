#include "platform/services/DateFormatter.h"

#include "support/Recording.h"

#include <gtest/gtest.h>

namespace orvane
{

TEST(DateFormatterTest, PutsTimesIntoWordsInTheLocalZone)
{
    TestClock clock;
    const DateFormatter formatter("'Updated' yyyy-MM-dd 'at' HH:mm:ss");
    const auto text = [&] { return formatter.stringFromDate(clock.now, clock); };
    EXPECT_EQ(text(), "Updated 2026-11-21 at 10:00:00");
    clock.now += 0.9;
    EXPECT_EQ(text(), "Updated 2026-11-21 at 10:00:00");
    clock.zone.secondsFromGmt = 5 * 3600 + 45 * 60;
    EXPECT_EQ(text(), "Updated 2026-11-21 at 15:45:00");
    clock.zone.secondsFromGmt = 14 * 3600;
    EXPECT_EQ(text(), "Updated 2026-11-22 at 00:00:00");
    clock.zone.secondsFromGmt = -11 * 3600;
    EXPECT_EQ(text(), "Updated 2026-11-20 at 23:00:00");
}

TEST(DateFormatterTest, LettersBetweenApostrophesAreThemselves)
{
    const TestClock clock;
    EXPECT_EQ(DateFormatter("'yyyy' yyyy-M 'a").stringFromDate(clock.now, clock), "yyyy 2026-M a");
    EXPECT_EQ(DateFormatter("").stringFromDate(clock.now, clock), "");
}

TEST(DateFormatterTest, NumbersHaveTheirLeadingZeros)
{
    const TestClock clock;
    EXPECT_EQ(DateFormatter("yyyy-MM-dd HH:mm:ss").stringFromDate(-62135596800.0 + 3661, clock),
              "0001-01-01 01:01:01");
}

} // namespace orvane
