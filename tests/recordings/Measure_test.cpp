#include "recordings/Measure.h"

#include <bit>
#include <gtest/gtest.h>
#include <limits>

namespace orvane
{
namespace
{

constexpr ValueName kNames[] = {
    {1, "One"}
};
constexpr ValueName kWidths[] = {
    {6, "1.4"}
};

constexpr Format kLevel = Format::fixed({.factor = 0.25, .offset = -140}, 2, " dBm");
constexpr Format kChange = Format::whole(" dB", {}).withPlus().withText(99, "Not Present");
constexpr Format kNamed = Format::named(kNames, "Unknown");
constexpr Format kWidth = Format::named(kWidths, "Unknown").withSuffix(" MHz");
constexpr Format kReal = Format::fixed({}, 2, "% (old)").withUnit("%").withValue(valueOfBits);

std::optional<std::string> measureText(const Format& format, std::int64_t raw)
{
    const RowDescription description = {"Row", &format};
    const auto measure = measureOf(PropertyValue::reading({&description, raw}));
    return measure ? std::optional(measure->number + "|" + measure->unit) : std::nullopt;
}

TEST(MeasureTest, IsTheNumberAndTheUnitOfAReading)
{
    EXPECT_EQ(measureText(kLevel, 170), "-97.50|dBm");
    EXPECT_EQ(measureText(kChange, 3), "3|dB");
    EXPECT_EQ(measureText(kWidth, 6), "1.4|MHz");
    EXPECT_EQ(measureText(kReal, bitsOfValue(3.214)), "3.21|%");
}

TEST(MeasureTest, NamesAndTextsMeasureNothing)
{
    EXPECT_EQ(measureText(kNamed, 1), std::nullopt);
    EXPECT_EQ(measureText(kNamed, 2), std::nullopt);
    EXPECT_EQ(measureText(kChange, 99), std::nullopt);
    EXPECT_EQ(measureText(kWidth, 7), std::nullopt);
    EXPECT_EQ(measureText(kReal, bitsOfValue(std::numeric_limits<double>::quiet_NaN())),
              std::nullopt);
    EXPECT_EQ(measureOf("1.8 to 2.0GHz PCS band [1]"), std::nullopt);
    EXPECT_EQ(measureOf("12"), std::nullopt);
    EXPECT_EQ(measureOf(PropertyValue::integer(12)), std::nullopt);
    EXPECT_EQ(measureOf({}), std::nullopt);
}

TEST(MeasureTest, ATextThatCameAsANumberIsOne)
{
    const auto measure = measureOf(PropertyValue::textReading({"+3.50 dB", "3.50", "dB"}));
    ASSERT_TRUE(measure);
    EXPECT_EQ(measure->number, "3.50");
    EXPECT_EQ(measure->unit, "dB");
}

std::optional<std::string_view> unitOf(std::initializer_list<const char*> units)
{
    static CommonUnit common;
    common = CommonUnit();
    for (const char* unit : units)
        common.take(unit ? std::optional(Measure{"1", unit}) : std::nullopt);
    return common.unit();
}

TEST(CommonUnitTest, IsThatOfAllValues)
{
    EXPECT_EQ(unitOf({"dB", "dB"}), "dB");
    EXPECT_EQ(unitOf({"", ""}), "");
}

TEST(CommonUnitTest, IsNoneWhereOneValueDiffers)
{
    EXPECT_EQ(unitOf({"dB", "dBm", "dB"}), std::nullopt);
    EXPECT_EQ(unitOf({"dB", ""}), std::nullopt);
    EXPECT_EQ(unitOf({"dB", nullptr}), std::nullopt);
    EXPECT_EQ(unitOf({nullptr, "dB"}), std::nullopt);
    EXPECT_EQ(unitOf({}), std::nullopt);
}

} // namespace
} // namespace orvane
