#include "LogGenerator/Formats.h"

#include <cinttypes>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

constexpr ValueName kColours[] = {
    {0, "Off"  },
    {1, "Amber"},
    {4, "Green"},
};

} // namespace

TEST(FormatsTest, DecimalsShowUnsignedNumbersAsCDoes)
{
    const struct {
        std::int64_t raw;
        const char* text;
        const char* unsignedText;
    } kNumbers[] = {
        {0,          "0",           "0"         },
        {2147483647, "2147483647",  "2147483647"},
        {2147483648, "-2147483648", "2147483648"},
        {4294967295, "-1",          "4294967295"},
        {-1,         "-1",          "4294967295"},
        {-90,        "-90",         "4294967206"},
    };
    for (const auto& number : kNumbers) {
        EXPECT_EQ(decimal(number.raw), number.text);
        EXPECT_EQ(unsignedDecimal(number.raw), number.unsignedText);
        EXPECT_EQ(decibels(number.raw), std::string(number.text) + " dB");
        EXPECT_EQ(decibelMilliwatts(number.raw), std::string(number.text) + " dBm");
    }
}

TEST(FormatsTest, PrintsTextsOfAnyLength)
{
    for (const int width : {0, 1, 127, 128, 129, 5000})
        EXPECT_EQ(printed("%*s", width, ""), std::string(static_cast<std::size_t>(width), ' '));
    EXPECT_EQ(printed("%s and %d", "one", 2), "one and 2");
}

TEST(FormatsTest, WholeNumbersAreWhatPrintfWrites)
{
    for (int bits = 0; bits < 63; ++bits) {
        const std::int64_t power = std::int64_t{1} << bits;
        for (const std::int64_t number : {power, power - 1, -power, -power - 1})
            EXPECT_EQ(wholeNumber(number), printed("%" PRId64, number));
    }
    EXPECT_EQ(wholeNumber(INT64_MIN), "-9223372036854775808");
    EXPECT_EQ(wholeNumber(-140, " dBm"), "-140 dBm");
}

TEST(FormatsTest, FixedPointNumbersAreWhatPrintfWrites)
{
    constexpr double kExtremes[] = {
        -0.0,
        -0.001,
        -0.005,
        0.005,
        1e15 + 0.3,
        5e-324,
        1.7976931348623157e308,
        -1.7976931348623157e308,
    };
    for (const int digits : {0, 1, 2, 6, kMostDigits}) {
        // Steps of 1/256 hold every fraction that levels come in, and each way to lie between two
        // digits.
        for (int step = -256 * 200; step <= 256 * 200; ++step)
            ASSERT_EQ(fixedPoint(step / 256.0, digits), printed("%.*f", digits, step / 256.0))
                << step;
        for (const double extreme : kExtremes)
            EXPECT_EQ(fixedPoint(extreme, digits), printed("%.*f", digits, extreme));
    }
    EXPECT_EQ(fixedPoint(-3.125, 2, " dB"), "-3.12 dB");
    EXPECT_EQ(fixedPoint(-3.375, 2, " dB"), "-3.38 dB");
}

TEST(FormatsTest, NamesValuesAndFallsBackForTheOthers)
{
    EXPECT_STREQ(nameOf(kColours, 4, "none"), "Green");
    EXPECT_STREQ(nameOf(kColours, 3, "none"), "none");
    EXPECT_STREQ(nameOf(kColours, -1, "none"), "none");
    EXPECT_EQ(nameOf({}, 0, nullptr), nullptr);
    EXPECT_EQ(named<kColours>(1), "Amber");
    EXPECT_EQ(named<kColours>(2), "Unknown");
}

} // namespace orvane
