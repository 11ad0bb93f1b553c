#include "platform/Utf8.h"

#include <gtest/gtest.h>

namespace orvane
{

TEST(ShownTextTest, KeepsWhatIsWellFormedAndReplacesTheRest)
{
    const struct {
        std::string_view text;
        const char* shown;
    } kCases[] = {
        {"plain",                     "plain"                               },
        {"12 × 64chips",             "12 × 64chips"                       },
        {"tab\tkept",                 "tab\tkept"                           },
        {"two\nlines\x7f",            "two lines "                          },
        {"bad\xFFone",                "bad\xEF\xBF\xBDone"                  },
        {"cut\xE2\x82",               "cut\xEF\xBF\xBD\xEF\xBF\xBD"         },
        {"\xED\xA0\x80",              "\xEF\xBF\xBD\xEF\xBF\xBD\xEF\xBF\xBD"},
        {"\xC0\xAF",                  "\xEF\xBF\xBD\xEF\xBF\xBD"            },
        {"\xF0\x9F\x93\xB6 ok",       "\xF0\x9F\x93\xB6 ok"                 },
        {"a\xEF\xBF\xBE\xEF\xBF\xBF", "a\xEF\xBF\xBD\xEF\xBF\xBD"           },
        {"",                          ""                                    },
    };
    for (const auto& text : kCases)
        EXPECT_EQ(shownText(text.text), text.shown);
}

} // namespace orvane
