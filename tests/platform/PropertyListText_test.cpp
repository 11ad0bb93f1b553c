#include "platform/PropertyListText.h"

#include "platform/PropertyList.h"

#include "support/PropertyListBytes.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

struct Utf8Case {
    const char* name;
    std::string_view text;
    bool isValid;
};

const Utf8Case kUtf8Cases[] = {
    {"empty", "",                    true           },
    {"ASCII", "plain",               true           },
    {"NUL",   std::string_view("\0", 1),              true},
    {"lowest of two",       "\xC2\x80",              true            },
    {"highest of two",       "\xDF\xBF",             true},
    {"lowest of three",       "\xE0\xA0\x80",            true       },
    {"below the surrogates",       "\xED\x9F\xBF",       true},
    {"above the surrogates",       "\xEE\x80\x80",       true       },
    {"highest of three",       "\xEF\xBF\xBF",           true},
    {"lowest of four",       "\xF0\x90\x80\x80",             true     },
    {"highest of all",       "\xF4\x8F\xBF\xBF",             true},
    {"continuation alone",       "\x80",         false             },
    {"overlong two",       "\xC0\x80",               false},
    {"overlong two, highest",       "\xC1\xBF",      false    },
    {"overlong three",       "\xE0\x9F\xBF",             false   },
    {"overlong four",       "\xF0\x8F\xBF\xBF",              false },
    {"lowest surrogate",       "\xED\xA0\x80",           false    },
    {"highest surrogate",       "\xED\xBF\xBF",          false},
    {"beyond the last",       "\xF4\x90\x80\x80",            false  },
    {"five bytes",       "\xF8\x88\x80\x80\x80",                 false },
    {"0xFF",       "\xFF",                       false                        },
    {"two cut short",       "\xC3",              false},
    {"three cut short",       "\xE2\x82",            false                  },
    {"four cut short",       "\xF0\x9F\x93",             false},
    {"third byte wrong",       "\xE2\x82z",           false                   },
    {"fourth byte wrong",       "\xF0\x9F\x93\xC0",          false},
};

TEST(PropertyListTextTest, WellFormedUtf8IsTold)
{
    for (const Utf8Case& each : kUtf8Cases)
        EXPECT_EQ(isValidUtf8(each.text), each.isValid) << each.name;
}

TEST(PropertyListTextTest, Utf8IsToldAtEveryPlaceOfALongText)
{
    for (const Utf8Case& each : kUtf8Cases)
        for (std::size_t before = 0; before < 20; ++before)
            for (const unsigned after : {0U, 1U, 7U, 8U, 9U}) {
                const std::string text =
                    std::string(before, 'a') + std::string(each.text) + std::string(after, 'z');
                EXPECT_EQ(isValidUtf8(text), each.isValid) << each.name << ' ' << before;
            }
}

TEST(PropertyListTextTest, Utf16BecomesUtf8InBothByteOrders)
{
    struct Case {
        Bytes bigEndian;
        std::string text;
    };
    for (const auto& [bytes, text] : {
             Case{{},                       ""                        },
             Case{{0, 'A'},                 "A"                       },
             Case{{0, 0x7F, 0, 0x80},       "\x7F\xC2\x80"            },
             Case{{7, 0xFF, 8, 0},          "\xDF\xBF\xE0\xA0\x80"    },
             Case{{0xD7, 0xFF, 0xE0, 0},    "\xED\x9F\xBF\xEE\x80\x80"},
             Case{{0xFF, 0xFF},             "\xEF\xBF\xBF"            },
             Case{{0xD8, 0, 0xDC, 0},       "\xF0\x90\x80\x80"        },
             Case{{0xD8, 0x3D, 0xDC, 0xE1}, "\xF0\x9F\x93\xA1"        },
             Case{{0xDB, 0xFF, 0xDF, 0xFF}, "\xF4\x8F\xBF\xBF"        },
    }) {
        EXPECT_EQ(utf8FromUtf16(bytes, std::endian::big).text, text);
        Bytes swapped = bytes;
        for (std::size_t i = 0; i < swapped.size(); i += 2)
            std::swap(swapped[i], swapped[i + 1]);
        EXPECT_EQ(utf8FromUtf16(swapped, std::endian::little).text, text);
    }
}

TEST(PropertyListTextTest, MalformedUtf16IsRefusedAtItsFirstWrongUnit)
{
    struct Case {
        const char* name;
        Bytes bytes;
        std::size_t fault;
    };
    for (const auto& [name, bytes, fault] : {
             Case{"half a unit",               {0},                                 0},
             Case{"half a unit at the end",    {0, 'a', 0},                         2},
             Case{"first surrogate at end",    {0, 'a', 0xD8, 0},                   2},
             Case{"first surrogate cut",       {0, 'a', 0xD8, 0, 0xDC},             2},
             Case{"first surrogate, letter",   {0xDB, 0xFF, 0, 'a'},                0},
             Case{"first surrogate twice",     {0xD8, 0, 0xD8, 0, 0xDC, 0},         0},
             Case{"second surrogate alone",    {0, 'a', 0, 'b', 0xDC, 0},           4},
             Case{"second surrogate, highest", {0xDF, 0xFF},                        0},
             Case{"pair, second surrogate",    {0xD8, 0, 0xDC, 0, 0xDC, 0, 0, 'a'}, 4},
    }) {
        const Utf16Conversion conversion = utf8FromUtf16(bytes, std::endian::big);
        EXPECT_FALSE(conversion.text) << name;
        EXPECT_EQ(conversion.faultOffset, fault) << name;
    }
}

TEST(PropertyListTextTest, ExcerptsStayOnOneLineAndAreCutBetweenCharacters)
{
    EXPECT_EQ(quotedExcerpt(""), "\"\"");
    EXPECT_EQ(quotedExcerpt("a\nb\tc"), "\"a b c\"");
    const std::string forty(40, 'x');
    EXPECT_EQ(quotedExcerpt(forty), "\"" + forty + "\"");
    EXPECT_EQ(quotedExcerpt(forty + "y"), "\"" + forty + "...\"");
    const std::string nearlyForty(38, 'x');
    EXPECT_EQ(quotedExcerpt(nearlyForty + "\xE2\x82\xAC"), "\"" + nearlyForty + "...\"");
}

} // namespace
} // namespace orvane
