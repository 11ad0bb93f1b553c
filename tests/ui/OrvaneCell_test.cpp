#include "ui/OrvaneCell.h"

#include "doubles/FakeScreen.h"

#include <gtest/gtest.h>

namespace orvane
{

namespace
{

// Bold characters are 9 points wide and a line of size 15 is 18 points high. A row without an
// accessory keeps 10 points free at its right: 310 points of content in a row of 320.
class OrvaneCellTest : public ::testing::Test
{
protected:
    static std::shared_ptr<OrvaneCell> valueRow(const std::string& key, const std::string& value)
    {
        const auto cell = OrvaneCell::withStyle(CellStyle::Value, "id");
        cell->setTexts(key, value);
        cell->setLayout();
        return cell;
    }

    FakeScreen screen{
        {320, 480}
    };
};

constexpr double kContentWidth = 310;

} // namespace

TEST_F(OrvaneCellTest, AKeyOnlyCellHasNeitherValueNorStrip)
{
    const auto cell = OrvaneCell::withStyleKey(CellStyle::Value, "id");
    EXPECT_EQ(cell->value(), nullptr);
    EXPECT_EQ(cell->strip(), nullptr);
    EXPECT_EQ(cell->key()->superview(), &cell->contentView());
    EXPECT_EQ(cell->key()->font(), Font::boldSystem(15));
    EXPECT_EQ(cell->key()->alignment(), TextAlignment::Left);
    EXPECT_EQ(cell->reuseIdentifier(), "id");
    EXPECT_EQ(cell->style(), CellStyle::Value);
}

TEST_F(OrvaneCellTest, AValueCellHasBothInTheStrip)
{
    const auto cell = OrvaneCell::withStyle(CellStyle::Value, "id");
    EXPECT_EQ(cell->key()->superview(), cell->strip().get());
    EXPECT_EQ(cell->value()->superview(), cell->strip().get());
    EXPECT_EQ(cell->strip()->superview(), &cell->contentView());
    EXPECT_EQ(cell->key()->font(), Font::boldSystem(15));
    EXPECT_EQ(cell->value()->font(), Font::system(15));
    EXPECT_EQ(cell->key()->alignment(), TextAlignment::Left);
    EXPECT_EQ(cell->value()->alignment(), TextAlignment::Left);
}

TEST_F(OrvaneCellTest, AKeyStandsTenPointsInAndInTheMiddleOfTheRow)
{
    const auto cell = OrvaneCell::withStyleKey(CellStyle::Value, "id");
    cell->setTexts("Group", "");
    cell->setLayoutKey();
    EXPECT_EQ(cell->key()->frame(), (Rect{10, 13, 45, 18}));
}

TEST_F(OrvaneCellTest, AValueThatFitsIsFlushAgainstTheRightEdge)
{
    const auto cell = valueRow("Key", "12345");
    EXPECT_EQ(cell->key()->frame(), (Rect{10, 13, 27, 18}));
    EXPECT_EQ(cell->value()->frame(), (Rect{kContentWidth - 45, 13, 45, 18}));
    EXPECT_EQ(cell->strip()->contentSize(), (Size{kContentWidth, 50}));
    EXPECT_EQ(cell->strip()->frame(), (Rect{0, 0, kContentWidth, 50}));
}

TEST_F(OrvaneCellTest, AValueThatFitsExactlyStandsAfterTheKeyAndDoesNotScroll)
{
    // 10 before the key, 50 between, 9 a character: 330 points for 3 + 27 characters.
    const auto cell = OrvaneCell::withStyle(CellStyle::Value, "id");
    cell->setTexts("Key", std::string(27, 'v'));
    cell->setFrame({0, 0, 10 + 50 + 30 * 9 + TableViewCell::kMargin, 44});
    cell->setLayout();
    EXPECT_EQ(cell->value()->frame().x, 10 + 27 + 50);
    EXPECT_EQ(cell->strip()->contentSize(), (Size{330, 50}));
    EXPECT_FALSE(cell->strip()->isScrollable());
}

TEST_F(OrvaneCellTest, ALongValueScrollsByTheWidthsOfKeyAndValue)
{
    const auto cell = valueRow("Key", std::string(40, 'v'));
    EXPECT_EQ(cell->value()->frame(), (Rect{10 + 27 + 50, 13, 360, 18}));
    EXPECT_EQ(cell->strip()->contentSize(), (Size{kContentWidth + 27 + 360, 50}));
    EXPECT_TRUE(cell->strip()->isScrollable());
}

TEST_F(OrvaneCellTest, ValuesAreMeasuredInTheBoldFontThatTheyAreNotDrawnIn)
{
    EXPECT_EQ(valueRow("K", "1234567890")->value()->frame().width, 90);
}

TEST_F(OrvaneCellTest, TheStripsHeightDoesNotFollowTheRows)
{
    const auto cell = OrvaneCell::withStyle(CellStyle::Value, "id");
    cell->setFrame({0, 0, 320, 100});
    cell->setLayout();
    EXPECT_EQ(cell->strip()->frame().height, 50);
    EXPECT_EQ(cell->strip()->contentSize().height, 50);
}

TEST_F(OrvaneCellTest, AKeyOnlyCellReusedForAValueShowsOnlyTheKey)
{
    const auto cell = OrvaneCell::withStyleKey(CellStyle::Value, "id");
    cell->setTexts("Key", "value");
    cell->setLayout();
    EXPECT_EQ(cell->key()->text(), "Key");
    EXPECT_EQ(cell->key()->frame(), (Rect{10, 13, 27, 18}));
    EXPECT_EQ(cell->contentView().subviews().size(), 1U);
}

TEST_F(OrvaneCellTest, AnAccessoryTakesItsRoomFromTheContent)
{
    const auto cell = OrvaneCell::withStyleKey(CellStyle::Value, "id");
    cell->setAccessory(CellAccessory::DisclosureIndicator);
    cell->setLayoutKey();
    EXPECT_EQ(cell->contentView().bounds().width, 320 - TableViewCell::kAccessoryWidth);
}

TEST_F(OrvaneCellTest, LabelsCanBeTakenAway)
{
    const auto cell = OrvaneCell::withStyle(CellStyle::Value, "id");
    cell->setKey(nullptr);
    cell->setValue(nullptr);
    cell->setTexts("key", "value");
    cell->setLayout();
    EXPECT_EQ(cell->strip()->contentSize(), (Size{kContentWidth, 50}));
}

} // namespace orvane
