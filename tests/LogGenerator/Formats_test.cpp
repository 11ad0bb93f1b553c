#include "LogGenerator/Formats.h"

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
