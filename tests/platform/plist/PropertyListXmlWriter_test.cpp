#include "platform/plist/PropertyList.h"

#include "platform/base/PropertyValue.h"
#include "support/PropertyListBytes.h"

#include <cmath>
#include <gtest/gtest.h>
#include <limits>

namespace orvane
{
namespace
{

std::string withFrame(const std::string& root)
{
    return "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<plist version=\"1.0\">\n" + root +
           "</plist>\n";
}

TEST(PropertyListXmlWriterTest, ContainersAreIndentedAndKeepTheirOrder)
{
    const PropertyValue value = PropertyValue::dictionaryOf({
        {"SetState",        "Streaming"                                                       },
        {"SetTsExtraCodes",
         PropertyValue::arrayOf({PropertyValue::integer(0xFF0001), PropertyValue::newArray()})},
        {"Nothing",         PropertyValue::newDictionary()                                    },
    });
    EXPECT_EQ(writeXmlPropertyList(value), withFrame("<dict>\n"
                                                     "\t<key>SetState</key>\n"
                                                     "\t<string>Streaming</string>\n"
                                                     "\t<key>SetTsExtraCodes</key>\n"
                                                     "\t<array>\n"
                                                     "\t\t<integer>16711681</integer>\n"
                                                     "\t\t<array/>\n"
                                                     "\t</array>\n"
                                                     "\t<key>Nothing</key>\n"
                                                     "\t<dict/>\n"
                                                     "</dict>\n"));
}

TEST(PropertyListXmlWriterTest, EachScalarHasItsForm)
{
    struct Case {
        PropertyValue value;
        const char* text;
    };
    const double infinity = std::numeric_limits<double>::infinity();
    for (const auto& [value, text] : {
             Case{"",                                                          "<string></string>\n"                     },
             Case{"a<b>&c\r",                                                  "<string>a&lt;b&gt;&amp;c&#13;</string>\n"},
             Case{PropertyValue::integer(-5),                                  "<integer>-5</integer>\n"                 },
             Case{PropertyValue::real(0.1),                                    "<real>0.1</real>\n"                      },
             Case{PropertyValue::real(1),                                      "<real>1</real>\n"                        },
             Case{PropertyValue::real(infinity),                               "<real>inf</real>\n"                      },
             Case{PropertyValue::real(-infinity),                              "<real>-inf</real>\n"                     },
             Case{PropertyValue::real(-std::nan("")),                          "<real>nan</real>\n"                      },
             Case{PropertyValue::largeNumber({"18446744073709551616", false}),
                  "<integer>18446744073709551616</integer>\n"                                                            },
             Case{PropertyValue::largeNumber({"1e400", true}),                 "<real>1e400</real>\n"                    },
             Case{PropertyValue::boolean(true),                                "<true/>\n"                               },
             Case{PropertyValue::boolean(false),                               "<false/>\n"                              },
             Case{PropertyValue::date({1795255200}),                           "<date>2026-11-21T10:00:00Z</date>\n"     },
             Case{PropertyValue::date({-0.5}),                                 "<date>1969-12-31T23:59:59Z</date>\n"     },
             Case{PropertyValue::data({}),                                     "<data>\n</data>\n"                       },
             Case{PropertyValue::data({'M'}),                                  "<data>\nTQ==\n</data>\n"                 },
             Case{PropertyValue::data({'M', 'a'}),                             "<data>\nTWE=\n</data>\n"                 },
             Case{PropertyValue::data({'M', 'a', 'n'}),                        "<data>\nTWFu\n</data>\n"                 },
    })
        EXPECT_EQ(writeXmlPropertyList(value), withFrame(text));
}

TEST(PropertyListXmlWriterTest, LongDataIsWrapped)
{
    const PropertyValue value = PropertyValue::arrayOf({PropertyValue::data(Bytes(49, 0))});
    EXPECT_EQ(writeXmlPropertyList(value),
              withFrame("<array>\n\t<data>\n\t" + std::string(64, 'A') +
                        "\n\tAA==\n\t</data>\n</array>\n"));
}

TEST(PropertyListXmlWriterTest, WhatXmlCannotCarryIsNotWritten)
{
    const auto isWritten = [](const PropertyValue& value) {
        // Neither alone nor inside a text.
        const bool alone = writeXmlPropertyList(value).has_value();
        const PropertyValue outer = PropertyValue::newArray();
        outer.asArray()->replaceElements({value});
        EXPECT_EQ(writeXmlPropertyList(outer).has_value(), alone);
        return alone;
    };
    EXPECT_FALSE(isWritten(PropertyValue()));
    for (char control = 0; control < 0x20; ++control) {
        const std::string text = "a" + std::string(1, control) + "b";
        const bool isCarried = control == '\t' || control == '\n' || control == '\r';
        EXPECT_EQ(isWritten(PropertyValue(text)), isCarried) << int{control};
        EXPECT_EQ(isWritten(PropertyValue::dictionaryOf({
                      {text, "value"}
        })),
                  isCarried)
            << int{control};
    }
    for (const char* text : {"\x80", "a\xC3", "\xED\xA0\x80", "\xEF\xBF\xBE", "x\xEF\xBF\xBF"})
        EXPECT_FALSE(isWritten(PropertyValue(text)));
    for (const char* text : {"\x7F", "\xC2\x85", "\xEF\xBF\xBD", "\xF0\x9F\xBF\xBF"}) {
        ASSERT_TRUE(isWritten(PropertyValue(text)));
        EXPECT_EQ(readText(*writeXmlPropertyList(text)).value, PropertyValue(text));
    }
}

TEST(PropertyListXmlWriterTest, DatesOfTheYears1To9999AreWritten)
{
    struct Case {
        double seconds;
        const char* text; // null where it is not written
    };
    const double first = -62135596800;
    const double last = 253402300799;
    const double infinity = std::numeric_limits<double>::infinity();
    for (const auto& [seconds, text] : {
             Case{first,        "0001-01-01T00:00:00Z"},
             Case{first - 0.5,  nullptr               },
             Case{last + 0.5,   "9999-12-31T23:59:59Z"},
             Case{last + 1,     nullptr               },
             Case{1e300,        nullptr               },
             Case{infinity,     nullptr               },
             Case{-infinity,    nullptr               },
             Case{std::nan(""), nullptr               },
    }) {
        const std::optional<std::string> written =
            writeXmlPropertyList(PropertyValue::date({seconds}));
        ASSERT_EQ(written.has_value(), text != nullptr) << seconds;
        if (text) {
            EXPECT_EQ(*written, withFrame("<date>" + std::string(text) + "</date>\n"));
        }
    }
}

// `levels` arrays, or dictionaries, one in another.
PropertyValue nested(std::size_t levels, bool inDictionaries)
{
    PropertyValue value =
        inDictionaries ? PropertyValue::newDictionary() : PropertyValue::newArray();
    for (std::size_t i = 1; i < levels; ++i)
        value = inDictionaries ? PropertyValue::dictionaryOf({
                                     {"key", value}
        })
                               : PropertyValue::arrayOf({value});
    return value;
}

TEST(PropertyListXmlWriterTest, NestingIsWrittenUpToTheLimit)
{
    for (const bool inDictionaries : {false, true}) {
        const PropertyValue deepest = nested(kPropertyListDepthLimit, inDictionaries);
        const std::optional<std::string> text = writeXmlPropertyList(deepest);
        ASSERT_TRUE(text);
        EXPECT_EQ(readText(*text).value, deepest);
        EXPECT_FALSE(writeXmlPropertyList(nested(kPropertyListDepthLimit + 1, inDictionaries)));
        EXPECT_FALSE(writeXmlPropertyList(PropertyValue::arrayOf({deepest, "text"})));
    }
}

TEST(PropertyListXmlWriterTest, IndentationEndsAt32Tabs)
{
    const std::string text = *writeXmlPropertyList(nested(40, false));
    EXPECT_NE(text.find("\n" + std::string(32, '\t') + "<array/>\n"), std::string::npos);
    EXPECT_EQ(text.find(std::string(33, '\t')), std::string::npos);
}

TEST(PropertyListXmlWriterTest, ContainerThatHoldsItselfIsNotWritten)
{
    const PropertyValue array = PropertyValue::newArray();
    array.asArray()->append(array);
    EXPECT_FALSE(writeXmlPropertyList(array));
    array.asArray()->clear(); // so that it can be released

    const PropertyValue dictionary = PropertyValue::newDictionary();
    dictionary.asDictionary()->set("self", dictionary);
    EXPECT_FALSE(writeXmlPropertyList(dictionary));
    dictionary.asDictionary()->clear();
}

} // namespace
} // namespace orvane
