#include "screens/toolkit/TableView.h"

#include "doubles/FakeScreen.h"

#include <gtest/gtest.h>

namespace orvane
{

namespace
{

// Rows of one identifier; counts the cells that it created.
class Rows final : public TableViewDataSource, public TableViewDelegate
{
public:
    std::size_t numberOfRowsInSection(TableView&, std::size_t) override { return texts.size(); }
    std::shared_ptr<TableViewCell> cellForRowAtIndexPath(TableView& table,
                                                         const IndexPath& indexPath) override
    {
        auto cell = table.dequeueReusableCell("cell");
        if (!cell) {
            ++madeCells;
            cell = std::make_shared<TableViewCell>(CellStyle::Default, "cell");
        }
        cell->textLabel().setText(texts[indexPath.row]);
        return cell;
    }
    void didSelectRowAtIndexPath(TableView&, const std::optional<IndexPath>& indexPath) override
    {
        selected.push_back(indexPath->row);
    }

    std::vector<std::string> texts;
    int madeCells = 0;
    std::vector<std::size_t> selected;
};

class TableViewTest : public ::testing::Test
{
protected:
    TableViewTest()
    {
        rows.texts = {"a", "b", "c", "d", "e"};
        table.setFrame({0, 0, 320, 132});
        table.setDataSource(&rows);
        table.setDelegate(&rows);
        table.reloadData();
    }
    std::string text(std::size_t row) const
    {
        const auto cell = table.cellForRow(row);
        return cell ? cell->textLabel().text() : "(none)";
    }

    FakeScreen screen;
    Rows rows;
    TableView table;
};

} // namespace

TEST_F(TableViewTest, OnlyVisibleRowsHaveCells)
{
    EXPECT_EQ(table.numberOfRows(), 5U);
    EXPECT_EQ(text(0), "(none)");
    table.setVisibleRows(1, 2);
    EXPECT_EQ(text(0), "(none)");
    EXPECT_EQ(text(1), "b");
    EXPECT_EQ(text(2), "c");
    EXPECT_EQ(text(3), "(none)");
    EXPECT_EQ(rows.madeCells, 2);
}

TEST_F(TableViewTest, RowsStandOneBelowTheOtherAcrossTheTable)
{
    table.setVisibleRows(0, 5);
    EXPECT_EQ(table.cellForRow(0)->frame(), (Rect{0, 0, 320, 44}));
    EXPECT_EQ(table.cellForRow(2)->frame(), (Rect{0, 88, 320, 44}));
    table.sizeToFit();
    EXPECT_EQ(table.frame(), (Rect{0, 0, 320, 220}));
}

TEST_F(TableViewTest, VisibleRowsBeyondTheEndCountForNothing)
{
    table.setVisibleRows(3, SIZE_MAX);
    EXPECT_EQ(text(4), "e");
    EXPECT_EQ(text(5), "(none)");
    table.setVisibleRows(SIZE_MAX, SIZE_MAX);
    EXPECT_EQ(text(4), "(none)");
}

TEST_F(TableViewTest, AfterAReloadEveryRowHasTheCellThatItHad)
{
    table.setVisibleRows(0, 5);
    std::vector<TableViewCell*> cells;
    for (std::size_t row = 0; row < 5; ++row)
        cells.push_back(table.cellForRow(row).get());
    rows.texts[3] = "changed";
    table.reloadData();
    for (std::size_t row = 0; row < 5; ++row)
        EXPECT_EQ(table.cellForRow(row).get(), cells[row]) << row;
    EXPECT_EQ(text(3), "changed");
    EXPECT_EQ(rows.madeCells, 5);
}

TEST_F(TableViewTest, ScrolledThroughAndBackEveryRowHasTheCellThatItHad)
{
    std::vector<TableViewCell*> cells;
    for (std::size_t row = 0; row < 5; ++row) {
        table.setVisibleRows(row, 1);
        cells.push_back(table.cellForRow(row).get());
    }
    table.reloadData();
    for (std::size_t row = 5; row-- > 0;) {
        table.setVisibleRows(row, 1);
        EXPECT_EQ(table.cellForRow(row).get(), cells[row]) << row;
    }
    EXPECT_EQ(rows.madeCells, 5);
}

TEST_F(TableViewTest, ARowWithoutACellOfItsOwnGetsTheOneLastPutInOfRowsThatAreGone)
{
    table.setVisibleRows(3, 2);
    TableViewCell* const last = table.cellForRow(4).get();
    rows.texts = {"a", "b"};
    table.reloadData();
    table.setVisibleRows(0, 2);
    EXPECT_EQ(table.cellForRow(0).get(), last);
    EXPECT_EQ(rows.madeCells, 2);
}

TEST_F(TableViewTest, OfALongTableNotEveryCellIsKept)
{
    rows.texts.assign(5000, "x");
    table.reloadData();
    for (std::size_t row = 0; row < 5000; row += 100)
        table.setVisibleRows(row, 100);
    table.setVisibleRows(0, 100);
    EXPECT_EQ(rows.madeCells, 5100);
}

TEST_F(TableViewTest, CellsOfAnotherIdentifierAreNotHandedBack)
{
    table.setVisibleRows(0, 1);
    rows.texts.clear();
    table.reloadData();
    EXPECT_EQ(table.dequeueReusableCell("other"), nullptr);
    EXPECT_NE(table.dequeueReusableCell("cell"), nullptr);
    EXPECT_EQ(table.dequeueReusableCell("cell"), nullptr);
}

TEST_F(TableViewTest, AnotherWidthLaysRowsOutAnew)
{
    table.setVisibleRows(0, 1);
    TableViewCell* const cell = table.cellForRow(0).get();
    table.setFrame({0, 0, 640, 88});
    EXPECT_EQ(table.cellForRow(0).get(), cell);
    EXPECT_EQ(cell->frame().width, 640);
}

TEST_F(TableViewTest, PressingSelectsAndTellsTheDelegate)
{
    table.selectRow(2);
    EXPECT_EQ(table.selectedRow(), 2U);
    table.deselectRow({0, 1}, false);
    EXPECT_EQ(table.selectedRow(), 2U);
    table.deselectRow({0, 2}, false);
    EXPECT_EQ(table.selectedRow(), std::nullopt);
    table.selectRow(5);
    EXPECT_EQ(rows.selected, (std::vector<std::size_t>{2}));
}

TEST_F(TableViewTest, AReloadForgetsTheSelection)
{
    table.selectRow(2);
    table.reloadData();
    EXPECT_EQ(table.selectedRow(), std::nullopt);
}

TEST_F(TableViewTest, WithoutADataSourceItIsEmpty)
{
    table.setDataSource(nullptr);
    table.setDelegate(nullptr);
    table.setVisibleRows(0, 3);
    table.selectRow(0);
    table.reloadData();
    EXPECT_EQ(table.numberOfRows(), 0U);
}

} // namespace orvane
