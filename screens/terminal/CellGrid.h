#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// What a piece of text is. The terminal decides how it looks.
enum class Ink {
    Plain,
    Quiet,   // less important than the rest
    Key,     // the name of a row, of a key to press
    Changed, // a value that the latest refresh changed
    Bar,     // the title line
    BarQuiet,
    Status, // the lines at the foot
    StatusKey,
    Warning,
    Mark, // a sign that is not a text, such as a bar
};

struct Style {
    Ink ink = Ink::Plain;
    bool isSelected = false;
    friend bool operator==(const Style&, const Style&) = default;
};

// The screen as a grid of characters. Pages draw onto it, and a terminal shows it.
class CellGrid
{
public:
    struct Cell {
        std::string text = " "; // empty for the second column of a wide character
        Style style;
        friend bool operator==(const Cell&, const Cell&) = default;
    };
    // The columns of a line into which something may be drawn.
    struct Span {
        int first = 0;
        int end = 0; // one beyond the last
    };

    CellGrid() = default;
    CellGrid(int lines, int columns);

    [[nodiscard]] int lines() const { return _lines; }
    [[nodiscard]] int columns() const { return _columns; }
    [[nodiscard]] Span wholeLine() const { return {0, _columns}; }
    // A blank for a place outside of the grid.
    [[nodiscard]] const Cell& at(int line, int column) const;
    // The text of the line, without blanks at its end.
    [[nodiscard]] std::string text(int line) const;

    // Draws the part of the text that is within the span and the grid. Returns the column after the
    // text. A wide character that is half outside is drawn as a blank.
    int put(int line, int column, std::string_view text, Style style, Span within);
    int put(int line, int column, std::string_view text, Style style)
    {
        return put(line, column, text, style, wholeLine());
    }
    void fill(int line, Span span, Style style);
    // Fills the lines with blanks in the plain style.
    void clear(int firstLine, int lineCount);

    friend bool operator==(const CellGrid&, const CellGrid&) = default;

private:
    void set(int line, int column, std::string text, Style style);

    int _lines = 0;
    int _columns = 0;
    std::vector<Cell> _cells;
};

} // namespace orvane
