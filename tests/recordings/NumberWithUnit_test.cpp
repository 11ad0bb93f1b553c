#include "recordings/NumberWithUnit.h"

#include <gtest/gtest.h>

#include <utility>

namespace orvane
{
namespace
{

using Parts = std::pair<std::string_view, std::string_view>;

std::optional<Parts> partsOf(std::string_view text)
{
    const auto parts = numberWithUnit(text);
    return parts ? std::optional(Parts(parts->number, parts->unit)) : std::nullopt;
}

TEST(NumberWithUnitTest, TakesNumbersAndTheirUnitsApart)
{
    EXPECT_EQ(partsOf("12"), Parts("12", ""));
    EXPECT_EQ(partsOf("-97.50 dBm"), Parts("-97.50", "dBm"));
    EXPECT_EQ(partsOf("3.21%"), Parts("3.21", "%"));
    EXPECT_EQ(partsOf("0 × 64chips"), Parts("0", "× 64chips"));
    EXPECT_EQ(partsOf("  5 sec"), Parts("5", "sec"));
    EXPECT_EQ(partsOf("3.21% (old)"), Parts("3.21", "% (old)"));
}

TEST(NumberWithUnitTest, APlusSignIsNotPartOfTheNumber)
{
    EXPECT_EQ(partsOf("+3.50 dB"), Parts("3.50", "dB"));
    EXPECT_EQ(partsOf("++3"), std::nullopt);
    EXPECT_EQ(partsOf("+-3"), Parts("-3", ""));
}

TEST(NumberWithUnitTest, LeadingZerosStay) { EXPECT_EQ(partsOf("00101"), Parts("00101", "")); }

TEST(NumberWithUnitTest, OtherTextsAreNoNumbers)
{
    for (const char* text : {"", " ", "dBm", "Idle", "0x1A", "12dBm", "1.2.3", "2026-11-21 10:00",
                             "10:00", "nan dB", "inf", "-", "%", "- 3", "3 4", "1,5 dB"})
        EXPECT_EQ(partsOf(text), std::nullopt) << text;
}

std::optional<std::string_view> unitOf(std::initializer_list<const char*> texts)
{
    static CommonUnit common;
    common = CommonUnit();
    for (const char* text : texts)
        common.take(text);
    return common.unit();
}

TEST(CommonUnitTest, IsThatOfAllTexts)
{
    EXPECT_EQ(unitOf({"1 dB", "-2 dB"}), "dB");
    EXPECT_EQ(unitOf({"1", "-2"}), "");
}

TEST(CommonUnitTest, IsNoneWhereOneTextDiffers)
{
    EXPECT_EQ(unitOf({"1 dB", "2 dBm", "1 dB"}), std::nullopt);
    EXPECT_EQ(unitOf({"1 dB", "2"}), std::nullopt);
    EXPECT_EQ(unitOf({"1 dB", "none"}), std::nullopt);
    EXPECT_EQ(unitOf({"none", "1 dB"}), std::nullopt);
}

TEST(CommonUnitTest, EmptyTextsDoNotCount)
{
    EXPECT_EQ(unitOf({"", "1 dB", ""}), "dB");
    EXPECT_EQ(unitOf({"", ""}), std::nullopt);
    EXPECT_EQ(unitOf({}), std::nullopt);
}

} // namespace
} // namespace orvane
