#pragma once

#include "screens/terminal/CellGrid.h"
#include "screens/terminal/TerminalDevice.h"

#include <functional>
#include <string>
#include <utility>
#include <vector>

namespace orvane
{

// The characters used as signs: good-looking ones, or ASCII for any terminal.
struct Marks {
    static Marks of(bool isBeautiful);

    std::string disclosure;
    std::string cut; // where a text is cut
    std::string check;
    std::string leftArrow;
    std::string rightArrow;
    std::string upDown;
    std::string play;
    std::string pause;
    std::string barDone;
    std::string barLeft;
    std::vector<std::string> indicator; // turns through these
};

// Lines of the screen that follow each other.
struct Lines {
    int first = 0;
    int count = 0;
    [[nodiscard]] int end() const { return first + count; }
};

// A key that works now, as shown at the foot of the screen.
struct Hint {
    std::string key;
    std::string what;
    Key press; // what a click on the hint presses
};

// A picture of the screen while it is drawn, and the effect of clicks on it.
struct Canvas {
    struct Zone {
        Lines lines;
        CellGrid::Span columns;
        // The column counts from the zone's first.
        std::function<void(int column)> click;
    };

    CellGrid grid;
    Marks marks;
    int turn = 0; // of a busy indicator
    CursorPlace cursor;
    std::vector<Zone> zones; // later ones lie over earlier ones

    [[nodiscard]] int columns() const { return grid.columns(); }
    void onClick(Lines lines, CellGrid::Span span, std::function<void(int column)> click)
    {
        zones.push_back({lines, span, std::move(click)});
    }
};

Key keyOfKind(Key::Kind kind);
Key keyOfCharacter(char32_t character);

} // namespace orvane
