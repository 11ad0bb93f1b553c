#include "platform/base/Reading.h"

#include "platform/base/PropertyValue.h"

#include <gtest/gtest.h>

#include <cmath>
#include <limits>

namespace orvane
{
namespace
{

constexpr ValueName kColours[] = {
    {0, "Off"  },
    {1, "Amber"},
};
constexpr ValueName kWidths[] = {
    {6,  "1.4"},
    {15, "3"  },
};

std::string thing(std::int64_t raw) { return "thing " + std::to_string(raw); }
RowText evenThing(std::int64_t raw)
{
    return raw % 2 == 0 ? RowText("thing " + std::to_string(raw)) : std::nullopt;
}
double half(std::int64_t raw) { return static_cast<double>(raw) / 2; }

constexpr Format kPlain;
constexpr Format kPower = Format::whole(" dBm", {.factor = 2, .offset = -140});
constexpr Format kLow8Bits = Format::whole("", {.mask = 0xFF});
constexpr Format kChange = Format::whole(" dB", {}).withPlus().withText(64, "Not Present");
constexpr Format kLevel = Format::fixed({.factor = 0.25, .offset = -140}, 2, " dBm");
constexpr Format kGain =
    Format::fixed({.factor = 334, .divisor = 1000, .offset = -63.248}, 2, " dBm").withPlus();
constexpr Format kReal = Format::fixed({}, 2, " dBm").withValue(valueOfBits).withWidth(4);
constexpr Format kReference =
    Format::fixed({}, 2, " dB").withValue(half).withPlus().withPrefix("(ref) ");
constexpr Format kColour = Format::named(kColours, "Unknown");
constexpr Format kKnownColour = Format::named(kColours, nullptr);
constexpr Format kOtherColour = Format::named(kColours, nullptr).withFallback(thing);
constexpr Format kFlag = Format::named({}, "True").withText(0, "False");
constexpr Format kWidth = Format::named(kWidths, "Unknown").withSuffix(" MHz");
constexpr Format kThing(thing);
constexpr Format kEvenThing(evenThing);

constexpr double kNan = std::numeric_limits<double>::quiet_NaN();

struct Case {
    const Format& format;
    std::int64_t raw;
    const char* text; // null where the row is not written
    const char* number = nullptr;
    const char* unit = "";
};

TEST(FormatTest, ShowsTextNumberAndUnitOfARawNumber)
{
    const Case kCases[] = {
        {kPlain,              12,                                             "12",                              "12"},
        {kPlain,                   4294967295,                                                            "-1",                                                                 "-1"},
        {kPower,               13,                                                             "-114 dBm",                         "-114", "dBm"},
        {kLow8Bits,         0x1234,"52","52"},
        {kChange,           3,                                           "+3 dB",                                                                                    "3", "dB"},
        {kChange,                   0,                                                           "+0 dB",                                                                                 "0", "dB"},
        {kChange,                -3,                                                          "-3 dB",        "-3", "dB"},
        {kChange,64,"Not Present",nullptr, "dB"},
        {kLevel,                   170,                                                           "-97.50 dBm",                                                                           "-97.50", "dBm"},
        {kLevel,               560,                                                         "0.00 dBm",                                                                                   "0.00", "dBm"},
        {kGain,                  0,                                                                       "-63.25 dBm",                                                                                                                                                                       "-63.25", "dBm"},
        {kGain,                   200,                                                            "+3.55 dBm",                                                                        "3.55", "dBm"},
        {kReal,           bitsOfValue(-7.126),                                                    "-7.13 dBm",           "-7.13", "dBm"},
        {kReal,  bitsOfValue(-kNan),std::signbit(-kNan) ? "-nan dBm" : " nan dBm",nullptr, "dBm"},
        {kReal,                   bitsOfValue(-INFINITY),                                                             "-inf dBm",                                                                            nullptr, "dBm"},
        {kReference,           3,                                                    "(ref) +1.50 dB","1.50", "dB"},
        {kColour,1,"Amber","1"},
        {kColour,                   2,                                                             "Unknown",                                                                 "2"},
        {kKnownColour,            1,                                                     "Amber",                                                                            "1"},
        {kKnownColour,2,                    nullptr,                                                                                                                        "2"},
        {kOtherColour,                   2,                                                             "thing 2",                                                      "2"},
        {kFlag,            0,                                                     "False",           "0"},
        {kFlag,        5,"True",                                                                                                "5"},
        {kWidth,                   6,                                                           "1.4 MHz",                                                                                              "1.4", "MHz"},
        {kWidth,                7,                                                              "Unknown",                                                                                                                                                                nullptr, "MHz"},
        {kThing,          7,"thing 7"},
        {kEvenThing,       8,"thing 8"},
        {kEvenThing,        7,                                                      nullptr                                                            },
    };
    for (const Case& each : kCases) {
        const std::string name = each.text ? each.text : "(no row)";
        EXPECT_EQ(each.format(each.raw), each.text ? RowText(each.text) : std::nullopt) << name;
        EXPECT_EQ(each.format.writes(each.raw), each.text != nullptr) << name;
        EXPECT_EQ(each.format.numberText(each.raw),
                  each.number ? std::optional<std::string>(each.number) : std::nullopt)
            << name;
        EXPECT_EQ(each.format.number(each.raw).has_value(), each.number != nullptr) << name;
        EXPECT_EQ(each.format.unit(), each.unit) << name;
    }
    EXPECT_EQ(kLevel.number(171), -97.25);
    EXPECT_EQ(kWidth.number(6), 1.4);
}

TEST(FormatTest, NamesAndTextsAreNoMeasures)
{
    for (const Format* format : {&kPlain, &kPower, &kLevel, &kReal, &kWidth})
        EXPECT_TRUE(format->isMeasure());
    for (const Format* format : {&kColour, &kKnownColour, &kOtherColour, &kFlag, &kThing})
        EXPECT_FALSE(format->isMeasure());
}

TEST(FormatTest, AUnitCanDifferFromTheSuffix)
{
    EXPECT_EQ(Format::fixed({}, 2, "% (old)").withUnit("%").unit(), "%");
}

constexpr RowDescription kLevelRow = {"Level", &kLevel};
constexpr RowDescription kOtherLevelRow = {"Other Level", &kLevel};
constexpr RowDescription kColourRow = {"Colour", &kColour};

TEST(ReadingTest, IsAValueThatReadsAsItsText)
{
    const PropertyValue level = PropertyValue::reading({&kLevelRow, 170, 5});
    EXPECT_EQ(level.text(), "-97.50 dBm");
    EXPECT_EQ(level.description(), "-97.50 dBm");
    EXPECT_STREQ(level.typeName(), "string");
    EXPECT_EQ(level.asString(), nullptr);
    EXPECT_TRUE(level.isText());
    EXPECT_EQ(level.deepCopy().asReading()->time, 5);
    EXPECT_EQ(PropertyValue::arrayOf({level, "x"}).description(), "(-97.50 dBm, x)");
}

TEST(ReadingTest, EqualsWhateverShowsTheSameText)
{
    const PropertyValue level = PropertyValue::reading({&kLevelRow, 170, 5});
    EXPECT_EQ(level, PropertyValue::reading({&kLevelRow, 170, 6}));
    EXPECT_EQ(level, PropertyValue::reading({&kOtherLevelRow, 170}));
    EXPECT_EQ(level, PropertyValue("-97.50 dBm"));
    EXPECT_EQ(PropertyValue("-97.50 dBm"), level);
    EXPECT_EQ(level, PropertyValue::textReading({"-97.50 dBm", "-97.50", "dBm"}));
    EXPECT_NE(level, PropertyValue::reading({&kLevelRow, 171, 5}));
    EXPECT_NE(level, PropertyValue("-97.25 dBm"));
    EXPECT_NE(level, PropertyValue());
    EXPECT_NE(level, PropertyValue::newDictionary());
    EXPECT_NE(PropertyValue::integer(12), PropertyValue::textReading({"12", "12", ""}));
}

TEST(ReadingTest, StandsUnderItsRowAtThePlaceOfTheRow)
{
    PropertyDictionary rows;
    rows.set("Level", "(none)");
    rows.set("Count", "7");
    rows.setReading({&kColourRow, 1, 1});
    rows.setReading({&kLevelRow, 170, 1});
    rows.setReading({&kColourRow, 0, 2});
    rows.setReading({&kLevelRow, 171, 2});
    const PropertyValue whole = std::make_shared<PropertyDictionary>(rows);
    EXPECT_EQ(whole.description(), "{Level = -97.25 dBm; Count = 7; Colour = Off}");
    EXPECT_EQ(rows["Level"].asReading()->time, 2);
    EXPECT_EQ(rows.readingAt(0)->raw, 171);
    EXPECT_EQ(rows.readingAt(1), nullptr);
    EXPECT_EQ(rows.readingAt(3), nullptr);
    rows.set("Level", "N/A");
    EXPECT_EQ(rows["Level"], PropertyValue("N/A"));
}

} // namespace
} // namespace orvane
