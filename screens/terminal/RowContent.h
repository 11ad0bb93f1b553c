#pragma once

#include "screens/terminal/Canvas.h"
#include "screens/toolkit/TableView.h"

#include <cstddef>
#include <memory>
#include <string>

namespace orvane
{

// The texts of a row, and their width.
struct RowContent {
    // Empty for null.
    static RowContent of(const TableViewCell* cell);

    // How far it can be scrolled sideways, in columns.
    [[nodiscard]] int overhang() const { return extent > width ? extent - width : 0; }

    std::string name;  // the first text
    std::string value; // the others
    bool isGroup = false;
    bool isStrip = false; // whether it can scroll sideways
    int extent = 0;       // columns that the texts need
    int width = 0;        // columns that they have
};

// How a row is drawn.
struct RowLook {
    bool isSelected = false;
    bool isChanged = false;
    int sideways = 0; // columns scrolled out at the left
};

// Draws the labels of the cell at the places of their frames, and the accessory at the right of the
// first `columns` columns.
void drawRow(Canvas& canvas, int line, int columns, const TableViewCell& cell, const RowLook& look);

// The cell of the row, laid out; null if the row does not exist. The table keeps at most about a
// thousand cells; others go back to its pool.
std::shared_ptr<TableViewCell> cellOfRow(TableView& table, std::size_t row);

} // namespace orvane
