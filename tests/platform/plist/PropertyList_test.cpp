#include "platform/plist/PropertyList.h"

#include "platform/base/PropertyValue.h"
#include "support/PropertyListBytes.h"

#include <cmath>
#include <gtest/gtest.h>
#include <limits>
#include <thread>

namespace orvane
{
namespace
{

TEST(PropertyListTest, BytesOfNeitherFormatAreNoPropertyList)
{
    for (const char* text : {"", "   \n", "plain text", "{ key = value; }", "bplist", "bplis",
                             "\xEF\xBB", "\x01\x02\x03"}) {
        const PropertyListResult result = readText(text);
        EXPECT_TRUE(result.value.isAbsent()) << text;
        EXPECT_TRUE(result.error == "neither an XML nor a binary property list at byte 0" ||
                    result.error == "binary property list of an unknown version at byte 6")
            << text << ": " << result.error;
    }
}

TEST(PropertyListTest, BinaryOfAnotherVersionIsRefused)
{
    for (const char* text : {"bplist01", "bplist15 and more", "bplist"})
        EXPECT_EQ(readText(text).error, "binary property list of an unknown version at byte 6");
}

TEST(PropertyListTest, EachFormatIsToldByItsFirstBytes)
{
    BinaryListBuilder binary;
    binary.ascii("text");
    EXPECT_EQ(binary.read().value, PropertyValue("text"));
    EXPECT_EQ(readText(xmlList("<string>text</string>")).value, PropertyValue("text"));
    EXPECT_EQ(readText(" \r\n\t" + xmlList("<string>text</string>")).value, PropertyValue("text"));
}

// Every value type, at once and nested.
PropertyValue variedValue()
{
    return PropertyValue::dictionaryOf({
        {"string",       "text"                                                      },
        {"",             "empty key"                                                 },
        {"spaces",       "  kept \t at both ends \n"                                 },
        {"marks",        "a < b && c > d ]]> \"quoted\" 'too'"                       },
        {"line ends",    "one\rtwo\r\nthree\n"                                       },
        {"multilingual", "\xC3\xA9\xE2\x82\xAC\xF0\x9F\x93\xA1"                      },
        {"empty",        ""                                                          },
        {"integer",      PropertyValue::integer(-42)                                 },
        {"lowest",       PropertyValue::integer(INT64_MIN)                           },
        {"highest",      PropertyValue::integer(INT64_MAX)                           },
        {"true",         PropertyValue::boolean(true)                                },
        {"false",        PropertyValue::boolean(false)                               },
        {"data",         PropertyValue::data({0, 1, 2, 253, 254, 255})               },
        {"no data",      PropertyValue::data({})                                     },
        {"date",         PropertyValue::date({1795255200})                           },
        {"array",
         PropertyValue::arrayOf({"one", PropertyValue::newArray(), PropertyValue::newDictionary(),
                                 PropertyValue::arrayOf({PropertyValue::real(0.1)})})},
    });
}

TEST(PropertyListTest, EveryTypeOfValueSurvivesWritingAndReading)
{
    const PropertyValue value = variedValue();
    const std::optional<std::string> text = writeXmlPropertyList(value);
    ASSERT_TRUE(text);
    const PropertyListResult result = readText(*text);
    EXPECT_EQ(result.error, "");
    EXPECT_EQ(result.value, value);
    // Not only equal but in the same order.
    EXPECT_EQ(result.value.description(), value.description());
}

TEST(PropertyListTest, ScalarsCanBeRoots)
{
    const PropertyValue values = variedValue();
    for (const auto& [key, value] : *values.asDictionary())
        EXPECT_EQ(readText(*writeXmlPropertyList(value)).value, value) << key;
}

TEST(PropertyListTest, RealsSurviveExactly)
{
    using Limits = std::numeric_limits<double>;
    for (const double number :
         {0.0, -0.0, 0.1, 1.0 / 3, -2.5, 1e22, 1e23, 123456789.0, Limits::max(), Limits::lowest(),
          Limits::min(), Limits::denorm_min(), Limits::epsilon(), Limits::infinity(),
          -Limits::infinity()}) {
        const PropertyValue read =
            readText(*writeXmlPropertyList(PropertyValue::real(number))).value;
        ASSERT_TRUE(read.asReal()) << number;
        EXPECT_EQ(std::bit_cast<std::uint64_t>(*read.asReal()),
                  std::bit_cast<std::uint64_t>(number))
            << number;
    }
    for (const double sign : {1.0, -1.0}) {
        const PropertyValue nan = PropertyValue::real(std::copysign(Limits::quiet_NaN(), sign));
        EXPECT_EQ(readText(*writeXmlPropertyList(nan)).value, nan);
    }
}

TEST(PropertyListTest, DataOfEveryLengthSurvives)
{
    Bytes bytes;
    for (unsigned length = 0; length < 200; ++length) {
        const PropertyValue value = PropertyValue::data(bytes);
        EXPECT_EQ(readText(*writeXmlPropertyList(value)).value, value) << length;
        bytes.push_back(static_cast<std::uint8_t>(length * 37));
    }
}

TEST(PropertyListTest, LargeDictionarySurvivesInItsOrder)
{
    const PropertyValue value = PropertyValue::newDictionary();
    for (int i = 0; i < 2000; ++i)
        value.asDictionary()->set("key " + std::to_string(i * 7919 % 2000),
                                  PropertyValue::integer(i));
    const PropertyValue read = readText(*writeXmlPropertyList(value)).value;
    EXPECT_EQ(read.description(), value.description());
}

TEST(PropertyListTest, ThreadsReadAndWriteAtTheSameTime)
{
    const PropertyValue value = variedValue();
    const std::string text = *writeXmlPropertyList(value);
    int failures[2] = {};
    const auto work = [&text](int& count) {
        for (int i = 0; i < 50; ++i) {
            const PropertyValue read = readText(text).value;
            count += !read || writeXmlPropertyList(read) != text;
        }
    };
    std::thread other(work, std::ref(failures[0]));
    work(failures[1]);
    other.join();
    EXPECT_EQ(failures[0] + failures[1], 0);
}

} // namespace
} // namespace orvane
