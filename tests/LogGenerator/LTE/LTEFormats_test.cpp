#include "LogGenerator/LTE/LTEFormats.h"

#include "LogGenerator/Formats.h"

#include <gtest/gtest.h>

namespace orvane
{

namespace
{

// The raw numbers that the widest field of each kind can hold.
constexpr std::int64_t kRawNumbers = 65536;

} // namespace

TEST(LTEFormatsTest, LevelsReadAsPrintfWritesThem)
{
    for (std::int64_t raw = 0; raw < kRawNumbers; ++raw) {
        const auto number = static_cast<double>(raw);
        ASSERT_EQ(rsrpQuarterDb(raw), printed("%4.2f dBm", number * 0.25 - 140.0)) << raw;
        ASSERT_EQ(rsrpHalfDb(raw), printed("%4.2f dBm", number * 0.5 - 140.0)) << raw;
        ASSERT_EQ(rsrqEighthDb(raw), printed("%4.2f dB", number * 0.125 - 20.0)) << raw;
        ASSERT_EQ(rsrqQuarterDb(raw), printed("%4.2f dB", number * 0.25 - 30.0)) << raw;
        ASSERT_EQ(rssiHalfDb(raw), printed("%4.2f dBm", number * 0.5 - 140.0)) << raw;
    }
}

TEST(LTEFormatsTest, PowersAreWholeDecibels)
{
    EXPECT_EQ(minus30(0), "-30 dBm");
    EXPECT_EQ(minus30(30), "0 dBm");
    EXPECT_EQ(minus30(127), "97 dBm");
    EXPECT_EQ(qrxlevmin(0), "-140 dBm");
    EXPECT_EQ(qrxlevmin(63), "-14 dBm");
}

} // namespace orvane
