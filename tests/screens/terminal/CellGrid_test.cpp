#include "screens/terminal/CellGrid.h"

#include <gtest/gtest.h>

namespace orvane
{

namespace
{

constexpr Style kPlain{};

} // namespace

TEST(CellGridTest, TextIsDrawnAndTheColumnAfterItTold)
{
    CellGrid grid(2, 10);
    EXPECT_EQ(grid.put(1, 2, "abc", {Ink::Key, true}), 5);
    EXPECT_EQ(grid.text(1), "  abc");
    EXPECT_EQ(grid.text(0), "");
    EXPECT_EQ(grid.at(1, 3).style, (Style{Ink::Key, true}));
    EXPECT_EQ(grid.at(1, 5).style, kPlain);
}

TEST(CellGridTest, WhatIsOutsideTheSpanOrTheGridIsNotDrawn)
{
    CellGrid grid(1, 10);
    grid.put(0, -2, "abcdefghijklmnop", kPlain, {2, 5});
    EXPECT_EQ(grid.text(0), "  efg");
    grid.put(5, 0, "abc", kPlain);
    grid.put(-1, 0, "abc", kPlain);
    grid.put(0, 8, "xyz", kPlain);
    EXPECT_EQ(grid.text(0), "  efg   xy");
}

TEST(CellGridTest, AWideCharacterHasTwoCellsOrIsLeftOut)
{
    CellGrid grid(1, 6);
    EXPECT_EQ(grid.put(0, 0, "世a", kPlain), 3);
    EXPECT_EQ(grid.at(0, 1).text, "");
    EXPECT_EQ(grid.text(0), "世a");
    CellGrid narrow(1, 3);
    narrow.put(0, 0, "世界", kPlain);
    EXPECT_EQ(narrow.text(0), "世") << "half of a character is a blank";
    narrow.put(0, -1, "界b", kPlain);
    EXPECT_EQ(narrow.text(0), " b");
}

TEST(CellGridTest, HalfOfAWideCharacterDoesNotStayAlone)
{
    CellGrid grid(1, 6);
    grid.put(0, 0, "世界", kPlain);
    grid.put(0, 1, "xy", kPlain);
    EXPECT_EQ(grid.text(0), " xy");
    grid.put(0, 0, "世界", kPlain);
    grid.put(0, 0, "x", kPlain);
    EXPECT_EQ(grid.text(0), "x 界");
    grid.put(0, 0, "世界", kPlain);
    grid.put(0, 1, "人", kPlain);
    EXPECT_EQ(grid.text(0), " 人");
}

TEST(CellGridTest, LinesAreCleared)
{
    CellGrid grid(3, 4);
    for (int line = 0; line < 3; ++line)
        grid.put(line, 0, "abcd", {Ink::Bar, false});
    grid.clear(1, 5);
    EXPECT_EQ(grid.text(0), "abcd");
    EXPECT_EQ(grid.text(1), "");
    EXPECT_EQ(grid.at(2, 3).style, kPlain);
}

} // namespace orvane
