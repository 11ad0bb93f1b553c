#pragma once

#include "screens/terminal/CellGrid.h"

#include <ncurses.h>

namespace orvane
{

// How each kind of text looks: in colour where the terminal has colours and NO_COLOR is not set,
// else by weight and reversal alone.
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
