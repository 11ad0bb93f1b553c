#include "platform/base/Utf8.h"

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

TEST(ValidUtf8Test, WellFormedTextIsTold)
{
    for (const Utf8Case& each : kUtf8Cases)
        EXPECT_EQ(isValidUtf8(each.text), each.isValid) << each.name;
}

TEST(ValidUtf8Test, IsToldAtEveryPlaceOfALongText)
{
    for (const Utf8Case& each : kUtf8Cases)
        for (std::size_t before = 0; before < 20; ++before)
            for (const unsigned after : {0U, 1U, 7U, 8U, 9U}) {
                const std::string text =
                    std::string(before, 'a') + std::string(each.text) + std::string(after, 'z');
                EXPECT_EQ(isValidUtf8(text), each.isValid) << each.name << ' ' << before;
            }
}

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

TEST(PrintableTextTest, HasNothingThatATerminalObeys)
{
    const struct {
        std::string_view text;
        const char* printed;
    } kCases[] = {
        {"plain",                           "plain"                          },
        {"12 × 64 chips, Größe, 世界", "12 × 64 chips, Größe, 世界"},
        {"\xF0\x9F\x93\xB6 ok",             "\xF0\x9F\x93\xB6 ok"            },
        {"\x1b]0;title\x07",                "\uFFFD]0;title\uFFFD"           },
        {"a\x1b[2Jb",                       "a\uFFFD[2Jb"                    },
        {"rub\x7fout",                      "rub\uFFFDout"                   },
        {"\u009b31m \u0080 \u009f",         "\uFFFD31m \uFFFD \uFFFD"        },
        {"\u00a0",                          "\u00a0"                         },
        {"a\tb\nc\rd\ve\ff",                "a b c d e f"                    },
        {"a\u0085b\u2028c\u2029d",          "a b c d"                        },
        {"gpj.\u202efdp",                   "gpj.fdp"                        },
        {"\u061c\u200e\u200f\u202a\u202d",  ""                               },
        {"\u2066\u2067\u2068\u2069",        ""                               },
        {"a\u200bb",                        "a\u200bb"                       },
        {"bad\xFFone",                      "bad\uFFFDone"                   },
        {"a raw\x9b[2J",                    "a raw\uFFFD[2J"                 },
        {"cut\xC2",                         "cut\uFFFD"                      },
        {"a\xEF\xBF\xBE",                   "a\uFFFD"                        },
        {"",                                ""                               },
    };
    for (const auto& text : kCases)
        EXPECT_EQ(printableText(text.text), text.printed);
    EXPECT_EQ(printableText(std::string_view("a\0b", 3)), "a\uFFFDb");
}

TEST(Utf8CharacterTest, IsReadFromItsBytes)
{
    for (const char32_t character : {U'a', U'\x7f', U'\u0080', U'\u07ff', U'\u0800', U'\uffff',
                                     U'\U00010000', U'\U0010ffff'}) {
        std::string text;
        appendUtf8(text, character);
        text += "rest";
        EXPECT_EQ(utf8Character(text, utf8CharacterLength(text)), character);
    }
}

} // namespace
} // namespace orvane
