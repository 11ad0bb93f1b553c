#pragma once

#include "screens/terminal/Canvas.h"
#include "screens/toolkit/TableView.h"

#include <cstddef>
#include <memory>
#include <string>

namespace orvane
{

// What a row of a table says, and how wide it is.
struct RowContent {
    // Of no cell: nothing at all.
    static RowContent of(const TableViewCell* cell);

    // How far it can be scrolled sideways, in columns.
    [[nodiscard]] int overhang() const { return extent > width ? extent - width : 0; }

    std::string name;  // the first text
    std::string value; // the others
    bool isGroup = false;
    bool isStrip = false; // has something that scrolls sideways
    int extent = 0;       // columns that its texts take
    int width = 0;        // columns that there are for them
};

// How a row is drawn.
struct RowLook {
    bool isSelected = false;
    bool isChanged = false;
    int sideways = 0; // columns that have left at the left
};

// Draws the labels of the cell where their frames say, and its accessory at the right of the first
// `columns` columns.
void drawRow(Canvas& canvas, int line, int columns, const TableViewCell& cell, const RowLook& look);

// The row's cell, laid out; null for a row that is not there. The table has a thousand cells at
// most: others go back to its pool.
std::shared_ptr<TableViewCell> cellOfRow(TableView& table, std::size_t row);

} // namespace orvane
