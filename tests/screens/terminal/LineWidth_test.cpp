#include "screens/terminal/LineWidth.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace orvane
{

namespace
{

using ::testing::ElementsAre;
using ::testing::IsEmpty;

std::string shownAs(std::string_view text)
{
    std::string shown;
    for (const Glyph& glyph : glyphsOf(text))
        shown += glyph.text;
    return shown;
}

} // namespace

TEST(LineWidthTest, AWideCharacterTakesTwoColumnsAndACombiningOneNone)
{
    EXPECT_EQ(columnsOf("abc"), 3);
    EXPECT_EQ(columnsOf("世界"), 4);
    EXPECT_EQ(columnsOf("e\u0301"), 1);
    EXPECT_EQ(columnsOf("\U0001F600"), 2);
    EXPECT_EQ(columnsOf(""), 0);
}

TEST(LineWidthTest, ACombiningCharacterStaysWithTheOneBefore)
{
    const auto glyphs = glyphsOf("e\u0301x");
    ASSERT_EQ(glyphs.size(), 2U);
    EXPECT_EQ(glyphs[0].text, "e\u0301");
    EXPECT_EQ(shownAs("\u0301x"), " \u0301x") << "on a blank where there is none";
}

TEST(LineWidthTest, NoMoreCombiningCharactersAreKeptThanATerminalTakes)
{
    std::string text = "a";
    for (int i = 0; i < 100; ++i)
        text += "\u0301";
    EXPECT_EQ(decoded(shownAs(text)).size(), 5U);
}

TEST(LineWidthTest, NothingThatATerminalWouldObeyIsLeft)
{
    EXPECT_EQ(shownAs("a\x1b[2Jb"), "a\uFFFD[2Jb");
    EXPECT_EQ(shownAs("\x07\x7f"), "\uFFFD\uFFFD");
    EXPECT_EQ(shownAs("\u009b31m"), "\uFFFD31m") << "also the control characters beyond ASCII";
    EXPECT_EQ(shownAs("a\tb\nc\rd"), "a b c d");
    EXPECT_EQ(shownAs("a\u202eb\u200dc\ufe0f"), "abc") << "nothing reorders or joins";
    EXPECT_EQ(shownAs("a\u061cb\u200fc\u2069d"), "abcd") << "controls of the writing direction";
    EXPECT_EQ(shownAs("a\u0085b\u2028c"), "a b c") << "ends of lines beyond ASCII";
    EXPECT_EQ(shownAs("a\xff\xc3"), "a\uFFFD\uFFFD") << "bytes that are no UTF-8";
    EXPECT_EQ(shownAs(std::string("a\0b", 3)), "a\uFFFDb");
}

TEST(LineWidthTest, ATextIsShortenedToColumnsWithAMark)
{
    EXPECT_EQ(shortened("abcdef", 6, "…"), "abcdef");
    EXPECT_EQ(shortened("abcdef", 5, "…"), "abcd…");
    EXPECT_EQ(shortened("世界人", 5, "…"), "世界…");
    EXPECT_EQ(shortened("世界人", 4, "…"), "世…");
    EXPECT_EQ(shortened("abc", 1, "…"), "…");
    EXPECT_EQ(shortened("abc", 0, "…"), "");
    EXPECT_EQ(shortened("abc", -1, "…"), "");
}

TEST(LineWidthTest, AParagraphIsBrokenAtBlanksAndOnlyLongWordsWithin)
{
    EXPECT_THAT(wrapped("one two three", 7), ElementsAre("one two", "three"));
    EXPECT_THAT(wrapped("  one   two ", 20), ElementsAre("one two"));
    EXPECT_THAT(wrapped("abcdefgh ij", 4), ElementsAre("abcd", "efgh", "ij"));
    EXPECT_THAT(wrapped("世界人", 4), ElementsAre("世界", "人"));
    EXPECT_THAT(wrapped("", 4), IsEmpty());
}

TEST(LineWidthTest, SearchingIgnoresCase)
{
    EXPECT_TRUE(containsIgnoringCase("Physical Cell ID", "cell id"));
    EXPECT_TRUE(containsIgnoringCase("Größe", "GRÖ"));
    EXPECT_TRUE(containsIgnoringCase("anything", ""));
    EXPECT_FALSE(containsIgnoringCase("Cell", "cells"));
}

TEST(LineWidthTest, DecodingAndEncodingMeet)
{
    for (const std::string text : {"", "a", "ä", "世", "\U0001F600", "aä世\U0001F600"})
        EXPECT_EQ(encoded(decoded(text)), text);
}

} // namespace orvane
