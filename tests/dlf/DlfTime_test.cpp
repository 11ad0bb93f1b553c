#include "dlf/DlfTime.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace orvane
{
namespace
{

struct Case {
    std::uint64_t timestamp;
    double seconds;
};

constexpr Case kCases[] = {
    {0,                                       315964800.0    }, // 1980-01-06 00:00:00
    {std::uint64_t{1} << 16,                  315964800.00125},
    {std::uint64_t{800} << 16,                315964801.0    },
    {std::uint64_t{800 * 86400} << 16,        316051200.0    },
 // 1 479 290 400 s after the epoch: 2026-11-21 10:00:00, 18 leap seconds not applied.
    {(std::uint64_t{1479290400} * 800) << 16, 1795255200.0   },
};

TEST(DlfTimeTest, UpperBitsAreStepsOfOnePointTwoFiveMillisecondsSince1980)
{
    for (const Case& each : kCases)
        EXPECT_DOUBLE_EQ(dlfSecondsSince1970(each.timestamp), each.seconds) << each.timestamp;
}

TEST(DlfTimeTest, InverseGivesTheTimestampBack)
{
    for (const Case& each : kCases)
        EXPECT_EQ(dlfTimestamp(each.seconds), each.timestamp) << each.seconds;
}

TEST(DlfTimeTest, EveryWholeStepOfASecondSurvivesTheWayThroughADouble)
{
    const std::uint64_t second = std::uint64_t{1479290400} * kDlfStepsPerSecond;
    for (std::uint64_t step = second; step < second + kDlfStepsPerSecond; ++step)
        ASSERT_EQ(dlfTimestamp(dlfSecondsSince1970(step << 16)), step << 16);
}

TEST(DlfTimeTest, FractionsComeBackAsNearAsADoubleHoldsThem)
{
    for (std::uint64_t fraction = 0; fraction < 65536; fraction += 97) {
        const std::uint64_t timestamp = (std::uint64_t{1183782848} * 800 << 16) + fraction;
        const double seconds = dlfSecondsSince1970(timestamp);
        EXPECT_NEAR(dlfSecondsSince1970(dlfTimestamp(seconds)), seconds, 5e-7);
    }
}

TEST(DlfTimeTest, TimesOutsideTheRangeBecomeItsEnds)
{
    constexpr auto kLast = std::numeric_limits<std::uint64_t>::max();
    EXPECT_EQ(dlfTimestamp(0), 0U);
    EXPECT_EQ(dlfTimestamp(-1e300), 0U);
    EXPECT_EQ(dlfTimestamp(315964799.999), 0U);
    EXPECT_EQ(dlfTimestamp(std::nan("")), 0U);
    EXPECT_EQ(dlfTimestamp(1e300), kLast);
    EXPECT_EQ(dlfTimestamp(std::numeric_limits<double>::infinity()), kLast);
    EXPECT_EQ(dlfTimestamp(-std::numeric_limits<double>::infinity()), 0U);
    // Just before the end: nothing wraps around.
    EXPECT_GT(dlfTimestamp(dlfSecondsSince1970(kLast)), kLast - (std::uint64_t{1} << 20));
}

} // namespace
} // namespace orvane
