#include "platform/plist/PropertyListText.h"

#include "platform/plist/PropertyList.h"

#include "support/PropertyListBytes.h"

#include <gtest/gtest.h>

namespace orvane
{
namespace
{

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
        EXPECT_EQ(utf8FromUtf16(bytes, std::endian::big), text);
        Bytes swapped = bytes;
        for (std::size_t i = 0; i < swapped.size(); i += 2)
            std::swap(swapped[i], swapped[i + 1]);
        EXPECT_EQ(utf8FromUtf16(swapped, std::endian::little), text);
    }
}

TEST(PropertyListTextTest, MalformedUtf16BecomesReplacementCharacters)
{
    struct Case {
        const char* name;
        Bytes bytes;
        const char* text;
    };
    for (const auto& [name, bytes, text] : {
             Case{"half a unit",               {0},                         "\uFFFD"          },
             Case{"half a unit at the end",    {0, 'a', 0},                 "a\uFFFD"         },
             Case{"first surrogate at end",    {0, 'a', 0xD8, 0},           "a\uFFFD"         },
             Case{"first surrogate cut",       {0, 'a', 0xD8, 0, 0xDC},     "a\uFFFD\uFFFD"   },
             Case{"first surrogate, letter",   {0xDB, 0xFF, 0, 'a'},        "\uFFFDa"         },
             Case{"first surrogate twice",     {0xD8, 0, 0xD8, 0, 0xDC, 0}, "\uFFFD\U00010000"},
             Case{"second surrogate alone",    {0, 'a', 0, 'b', 0xDC, 0},   "ab\uFFFD"        },
             Case{"second surrogate, highest", {0xDF, 0xFF},                "\uFFFD"          },
             Case{"pair, second surrogate",
                  {0xD8, 0, 0xDC, 0, 0xDC, 0, 0, 'a'},
                  "\U00010000\uFFFDa"                                                         },
    })
        EXPECT_EQ(utf8FromUtf16(bytes, std::endian::big), text) << name;
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
