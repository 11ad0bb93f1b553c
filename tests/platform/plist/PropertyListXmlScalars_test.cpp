#include "platform/base/PropertyValue.h"
#include "support/PropertyListBytes.h"

#include <cmath>
#include <gtest/gtest.h>
#include <limits>

namespace orvane
{
namespace
{

PropertyValue valueOf(const std::string& element)
{
    const PropertyListResult result = readText(xmlList(element));
    EXPECT_EQ(result.error, "") << element;
    return result.value;
}

// The error of a list of that element, without the position. Checks that the position is that of
// the element's first byte.
std::string faultOf(const std::string& element)
{
    const PropertyListResult result = readText(xmlList(element));
    EXPECT_TRUE(result.value.isAbsent()) << element;
    const std::string position = " at line 1, column 22";
    EXPECT_TRUE(result.error.ends_with(position)) << element << ": " << result.error;
    return result.error.substr(0, result.error.size() -
                                      std::min(result.error.size(), position.size()));
}

TEST(PropertyListXmlScalarsTest, IntegersAreReadInEveryForm)
{
    struct Case {
        const char* text;
        std::int64_t number;
    };
    for (const auto& [text, number] : {
             Case{"0",                    0        },
             Case{"-0",                   0        },
             Case{"007",                  7        },
             Case{"+42",                  42       },
             Case{"-42",                  -42      },
             Case{" \n\t\r12\r\t\n ",     12       },
             Case{"0x1F",                 31       },
             Case{"0XfF",                 255      },
             Case{"-0x10",                -16      },
             Case{"+0x10",                16       },
             Case{"9223372036854775807",  INT64_MAX},
             Case{"-9223372036854775808", INT64_MIN},
             Case{"0x7FFFFFFFFFFFFFFF",   INT64_MAX},
             Case{"-0x8000000000000000",  INT64_MIN},
    })
        EXPECT_EQ(valueOf("<integer>" + std::string(text) + "</integer>"),
                  PropertyValue::integer(number))
            << text;
}

// Expects that the element is read as that large number and written as it was read.
void expectLargeNumber(const std::string& element, const PropertyLargeNumber& number)
{
    const PropertyValue value = valueOf(element);
    EXPECT_EQ(value, PropertyValue::largeNumber(number)) << element;
    EXPECT_EQ(value.asInteger(), std::nullopt);
    EXPECT_EQ(value.asReal(), std::nullopt);
    const auto written = writeXmlPropertyList(value);
    ASSERT_TRUE(written) << element;
    EXPECT_EQ(readText(*written).value, value) << element;
    EXPECT_NE(written->find('>' + number.digits + '<'), std::string::npos) << *written;
}

TEST(PropertyListXmlScalarsTest, IntegersBeyond64SignedBitsKeepTheirDigits)
{
    for (const char* text : {"9223372036854775808", "-9223372036854775809", "18446744073709551615",
                             "18446744073709551616", "100000000000000000000000000000000000000000",
                             "0x8000000000000000", "0xFFFFFFFFFFFFFFFF", "-0x8000000000000001"})
        expectLargeNumber("<integer> " + std::string(text) + "\n</integer>", {text, false});
}

TEST(PropertyListXmlScalarsTest, TextsThatAreNoIntegerAreRefused)
{
    for (const std::string text : {"", " ", "+", "-", "--1", "+-1", "-+1", "- 1", "1 2", "1.0",
                                   "1e3", "0x", "x1", "0x-1", "0xG", "12a", "one"})
        EXPECT_EQ(faultOf("<integer>" + text + "</integer>"), "\"" + text + "\" is not an integer");
}

TEST(PropertyListXmlScalarsTest, RealsAreReadInEveryForm)
{
    const double infinity = std::numeric_limits<double>::infinity();
    struct Case {
        const char* text;
        double number;
    };
    for (const auto& [text, number] : {
             Case{"0",                      0                                        },
             Case{"-1.5",                   -1.5                                     },
             Case{"+1.5",                   1.5                                      },
             Case{".5",                     0.5                                      },
             Case{"5.",                     5                                        },
             Case{" \n1e3\t",               1000                                     },
             Case{"1E-3",                   0.001                                    },
             Case{"0.1",                    0.1                                      },
             Case{"5e-324",                 std::numeric_limits<double>::denorm_min()},
             Case{"1.7976931348623157e308", std::numeric_limits<double>::max()       },
             Case{"inf",                    infinity                                 },
             Case{"+inf",                   infinity                                 },
             Case{"-inf",                   -infinity                                },
             Case{"Infinity",               infinity                                 },
             Case{"-infinity",              -infinity                                },
             Case{"nan",                    std::nan("")                             },
             Case{"NaN",                    std::nan("")                             },
    })
        EXPECT_EQ(valueOf("<real>" + std::string(text) + "</real>"), PropertyValue::real(number))
            << text;
}

TEST(PropertyListXmlScalarsTest, RealsBeyondTheRangeKeepTheirDigits)
{
    for (const char* text : {"1e309", "-1e309", "1e-400", "1e99999999999999999999"})
        expectLargeNumber("<real> " + std::string(text) + "\n</real>", {text, true});
}

TEST(PropertyListXmlScalarsTest, TextsThatAreNoRealAreRefused)
{
    for (const std::string text : {"", "+", "-", "+-1", "--1", "1,5", "1.5.5", "1e", "0x10", "1 2",
                                   "nan(7)", "infinite", "e5", "."})
        EXPECT_EQ(faultOf("<real>" + text + "</real>"), "\"" + text + "\" is not a real number");
}

TEST(PropertyListXmlScalarsTest, DatesAreReadInUtc)
{
    struct Case {
        const char* text;
        double seconds;
    };
    for (const auto& [text, seconds] : {
             Case{"1970-01-01T00:00:00Z",       0           },
             Case{"2026-11-21T10:00:00Z",       1795255200  },
             Case{"\n 2026-11-21T10:00:00Z \n", 1795255200  },
             Case{"1969-12-31T23:59:59Z",       -1          },
             Case{"2000-02-29T00:00:00Z",       951782400   },
             Case{"2024-02-29T23:59:59Z",       1709251199  },
             Case{"0001-01-01T00:00:00Z",       -62135596800},
             Case{"9999-12-31T23:59:59Z",       253402300799},
    })
        EXPECT_EQ(valueOf("<date>" + std::string(text) + "</date>"), PropertyValue::date({seconds}))
            << text;
}

TEST(PropertyListXmlScalarsTest, TextsThatAreNoDateAreRefused)
{
    for (const std::string text :
         {"", "2026-11-21", "2026-11-21T10:00:00", "2026-11-21 10:00:00Z", "2026-11-21T10:00:00z",
          "2026-11-21T10:00:00.5Z", "26-11-21T10:00:00Z", "-026-11-21T10:00:00Z",
          "2026-11-21T10:00:0/Z", "2026-11-21T10:00:0:Z"})
        EXPECT_EQ(faultOf("<date>" + text + "</date>"),
                  "\"" + text + "\" is not a date of the form YYYY-MM-DDThh:mm:ssZ");
    for (const std::string text :
         {"0000-01-01T00:00:00Z", "2026-00-21T10:00:00Z", "2026-13-21T10:00:00Z",
          "2026-11-00T10:00:00Z", "2026-11-31T10:00:00Z", "2026-02-29T10:00:00Z",
          "1900-02-29T10:00:00Z", "2024-02-30T10:00:00Z", "2026-12-32T10:00:00Z",
          "2026-11-21T24:00:00Z", "2026-11-21T10:60:00Z", "2026-11-21T10:00:60Z"})
        EXPECT_EQ(faultOf("<date>" + text + "</date>"),
                  "\"" + text + "\" is not a date of the calendar");
}

TEST(PropertyListXmlScalarsTest, DataIsReadFromBase64)
{
    struct Case {
        const char* text;
        Bytes bytes;
    };
    for (const auto& [text, bytes] : {
             Case{"",                 {}                      },
             Case{" \n\t ",           {}                      },
             Case{"TQ==",             {'M'}                   },
             Case{"TWE=",             {'M', 'a'}              },
             Case{"TWFu",             {'M', 'a', 'n'}         },
             Case{"\n\tTW\n\tFu\r\n", {'M', 'a', 'n'}         },
             Case{"TWFuTQ= =",        {'M', 'a', 'n', 'M'}    },
             Case{"+/+/",             {0xFB, 0xFF, 0xBF}      },
             Case{"/////w==",         {0xFF, 0xFF, 0xFF, 0xFF}},
    })
        EXPECT_EQ(valueOf("<data>" + std::string(text) + "</data>"), PropertyValue::data(bytes))
            << text;
}

TEST(PropertyListXmlScalarsTest, TextsThatAreNoBase64AreRefused)
{
    for (const std::string text : {"TWF*", "=", "====", "T===", "TQ=x", "TQ==TWFu",
                                   "TQ===", "TWFu=", "TW-_", "\xC3\xA9\xC3\xA9"})
        EXPECT_EQ(faultOf("<data>" + text + "</data>"), "\"" + text + "\" is not base64 text");
    for (const std::string text : {"T", "TQ", "TQ=", "TWE", "TWFuT"})
        EXPECT_EQ(faultOf("<data>" + text + "</data>"),
                  "\"" + text + "\" is not whole base64 text");
}

TEST(PropertyListXmlScalarsTest, LongTextIsCutInTheFailure)
{
    EXPECT_EQ(faultOf("<integer>" + std::string(1000, 'x') + "</integer>"),
              "\"" + std::string(40, 'x') + "...\" is not an integer");
}

} // namespace
} // namespace orvane
