#include "recordings/LogReading.h"

#include "platform/base/TelephonyConstants.h"

#include "recordings/support/LogFiles.h"
#include "support/Recording.h"

#include <gmock/gmock.h>

namespace orvane
{
namespace
{

using namespace std::chrono_literals;
using testing::HasSubstr;

class LogReadingTest : public ::testing::Test
{
protected:
    LogReadingTest() { services.useShippedResources(); }

    static std::shared_ptr<ByteSource> longLog()
    {
        LogBuilder builder;
        for (std::uint16_t i = 0; i < 5000; ++i)
            builder.measurement(kLogStart + i * kLogSecond, i);
        return builder.source();
    }

    TestServices services;
};

TEST_F(LogReadingTest, TheTechnologyIsSoughtAndThenTheLogRead)
{
    LogReading reading(longLog(), "a.dlf", {});
    double progress = 0;
    EXPECT_FALSE(reading.timeline());
    while (reading.readSlice()) {
        EXPECT_GE(reading.progress(), progress);
        progress = reading.progress();
    }
    EXPECT_GT(progress, 0.5);
    EXPECT_EQ(reading.progress(), 1);
    ASSERT_TRUE(reading.isRead());
    EXPECT_EQ(reading.timeline()->duration(), 4999s);
}

TEST_F(LogReadingTest, AGivenTechnologyIsNotSought)
{
    const LogReading reading(longLog(), "a.dlf", kTSLogChannelTechnology_Varnel_LTE);
    EXPECT_TRUE(reading.timeline());
    EXPECT_FALSE(reading.isRead());
}

TEST_F(LogReadingTest, WhereTheSearchIsStoppedTheLogEnds)
{
    LogReading reading(longLog(), "a.dlf", {});
    EXPECT_TRUE(reading.readSlice());
    reading.stop();
    EXPECT_FALSE(reading.isRead());
    while (reading.readSlice()) {
    }
    ASSERT_TRUE(reading.isRead());
    EXPECT_GT(reading.timeline()->duration(), 900s);
    EXPECT_LT(reading.timeline()->duration(), 1100s);
}

TEST_F(LogReadingTest, WhatIsNoLogFails)
{
    LogReading reading(sourceOf(Bytes(5000, 0xED)), "x.jpg", {});
    while (reading.readSlice()) {
    }
    EXPECT_FALSE(reading.isRead());
    EXPECT_THAT(reading.failure().value_or(""), HasSubstr("\"x.jpg\" is neither"));
}

} // namespace
} // namespace orvane
