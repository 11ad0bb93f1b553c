#include "LogGenerator/TextReadings.h"

#include "LogGenerator/MessageTime.h"

#include <gtest/gtest.h>

#include <utility>

namespace orvane
{
namespace
{

using Parts = std::pair<std::string, std::string>;

std::optional<Parts> partsOf(std::string_view text)
{
    const auto reading = textReading(text);
    return reading ? std::optional(Parts(reading->number, reading->unit)) : std::nullopt;
}

TEST(TextReadingsTest, TakeNumbersAndTheirUnitsApart)
{
    EXPECT_EQ(partsOf("12"), Parts("12", ""));
    EXPECT_EQ(partsOf("-97.50 dBm"), Parts("-97.50", "dBm"));
    EXPECT_EQ(partsOf("3.21%"), Parts("3.21", "%"));
    EXPECT_EQ(partsOf("0 × 64chips"), Parts("0", "× 64chips"));
    EXPECT_EQ(partsOf("5 sec"), Parts("5", "sec"));
}

TEST(TextReadingsTest, APlusSignIsNotPartOfTheNumber)
{
    EXPECT_EQ(partsOf("+3.50 dB"), Parts("3.50", "dB"));
    EXPECT_EQ(partsOf("++3"), std::nullopt);
    EXPECT_EQ(partsOf("+-3"), std::nullopt);
}

TEST(TextReadingsTest, LeadingZerosStay) { EXPECT_EQ(partsOf("00101"), Parts("00101", "")); }

TEST(TextReadingsTest, OtherTextsAreNoNumbers)
{
    for (const char* text : {"",
                             " ",
                             "dBm",
                             "Idle",
                             "0x1A",
                             "12dBm",
                             "1.2.3",
                             "2026-11-21 10:00",
                             "10:00",
                             "nan dB",
                             "inf",
                             "-",
                             "%",
                             "- 3",
                             "3 4",
                             "1,5 dB",
                             "1.",
                             ".5",
                             "1e3",
                             " 5",
                             "5 ",
                             "5  dB",
                             "5 km",
                             "1.8 to 2.0GHz PCS band [1]",
                             "(ref pilot) -5.00 dB",
                             "3.21% (old)"})
        EXPECT_EQ(partsOf(text), std::nullopt) << text;
}

TEST(TextReadingsTest, ATreeKeepsItsTextsAndItsShape)
{
    const PropertyValue tree = PropertyValue::dictionaryOf({
        {"Level", "-97 dBm"                                               },
        {"List",  PropertyValue::arrayOf({"1", PropertyValue::newArray()})},
        {"State", "Idle"                                                  },
        {"Count", PropertyValue::integer(3)                               }
    });
    const MessageTime time(1000);
    const PropertyValue copy = withTextReadings(tree);
    EXPECT_EQ(copy, tree);
    EXPECT_EQ(copy.description(), tree.description());
    ASSERT_TRUE(copy["Level"].asTextReading());
    EXPECT_EQ(copy["Level"].asTextReading()->time, 1000);
    EXPECT_TRUE((*copy["List"].asArray())[0].asTextReading());
    EXPECT_EQ(copy["State"].asTextReading(), nullptr);
    EXPECT_EQ(tree["Level"].asTextReading(), nullptr);
}

} // namespace
} // namespace orvane
