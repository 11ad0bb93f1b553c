#include "platform/services/Clock.h"

#include <cstdlib>
#include <ctime>
#include <gtest/gtest.h>
#include <optional>
#include <string>

namespace orvane
{
namespace
{

// Sets the process's time zone, and restores it at its end.
class ZoneSetting
{
public:
    explicit ZoneSetting(const char* zone)
    {
        if (const char* const before = std::getenv("TZ"))
            _before = before;
        setenv("TZ", zone, 1);
        tzset();
    }
    ~ZoneSetting()
    {
        if (_before)
            setenv("TZ", _before->c_str(), 1);
        else
            unsetenv("TZ");
        tzset();
    }
    ZoneSetting(const ZoneSetting&) = delete;
    ZoneSetting& operator=(const ZoneSetting&) = delete;

private:
    std::optional<std::string> _before;
};

TEST(RealClockTest, ZoneIsThatOfTheMoment)
{
    const ZoneSetting zone("XYZ-1XYS,M3.5.0,M10.5.0/3"); // an hour east, two in summer
    const RealClock clock;
    const TimeZone winter = clock.timeZoneAt(1795255200);
    EXPECT_EQ(winter.secondsFromGmt, 3600);
    EXPECT_FALSE(winter.isDaylightSaving);
    const TimeZone summer = clock.timeZoneAt(1782000000.5);
    EXPECT_EQ(summer.secondsFromGmt, 7200);
    EXPECT_TRUE(summer.isDaylightSaving);
}

TEST(RealClockTest, ZoneWestOfGreenwichIsNegative)
{
    const ZoneSetting zone("XYZ3:30");
    EXPECT_EQ(RealClock().timeZoneAt(0).secondsFromGmt, -12600);
}

TEST(RealClockTest, TimeIsThatOfTheSystem)
{
    const std::time_t before = std::time(nullptr);
    const double now = RealClock().secondsSince1970();
    const std::time_t after = std::time(nullptr);
    // time() may lag behind by a tick.
    EXPECT_GE(now, static_cast<double>(before) - 1);
    EXPECT_LT(now, static_cast<double>(after) + 2);
}

} // namespace
} // namespace orvane
