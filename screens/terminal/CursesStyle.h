#pragma once

#include "screens/terminal/CellGrid.h"

#include <ncurses.h>

namespace orvane
{

// How each kind of text looks. Texts keep the terminal's own colours, which its user can read, and
// stand out by weight and reversal. Only marks are coloured, where the terminal has colours and
// NO_COLOR is not set.
class CursesStyle
{
public:
    // ncurses must have been started.
    CursesStyle();
    [[nodiscard]] attr_t attributes(Style style) const;
    [[nodiscard]] short pair(Style style) const;

private:
    bool _hasColours = false;
};

} // namespace orvane
