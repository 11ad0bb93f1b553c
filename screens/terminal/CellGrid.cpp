#include "screens/terminal/CellGrid.h"

#include "screens/terminal/LineWidth.h"

#include <algorithm>
#include <utility>

namespace orvane
{

CellGrid::CellGrid(int lines, int columns)
    : _lines(std::max(lines, 0)), _columns(std::max(columns, 0)),
      _cells(static_cast<std::size_t>(_lines) * static_cast<std::size_t>(_columns))
{
}

const CellGrid::Cell& CellGrid::at(int line, int column) const
{
    static const Cell blank;
    if (line < 0 || line >= _lines || column < 0 || column >= _columns)
        return blank;
    return _cells[static_cast<std::size_t>(line) * static_cast<std::size_t>(_columns) +
                  static_cast<std::size_t>(column)];
}

std::string CellGrid::text(int line) const
{
    std::string text;
    for (int column = 0; column < _columns; ++column)
        text += at(line, column).text;
    return text.substr(0, text.find_last_not_of(' ') + 1);
}

int CellGrid::put(int line, int column, std::string_view text, Style style, Span within)
{
    for (const Glyph& glyph : glyphsOf(text)) {
        const int end = column + glyph.columns;
        if (column >= within.first && end <= within.end) {
            set(line, column, glyph.text, style);
            if (glyph.columns == 2)
                set(line, column + 1, "", style);
        } else {
            fill(line, {std::max(column, within.first), std::min(end, within.end)}, style);
        }
        column = end;
    }
    return column;
}

void CellGrid::fill(int line, Span span, Style style)
{
    for (int column = std::max(span.first, 0); column < std::min(span.end, _columns); ++column)
        set(line, column, " ", style);
}

void CellGrid::clear(int firstLine, int lineCount)
{
    for (int line = firstLine; line < firstLine + lineCount; ++line)
        fill(line, wholeLine(), {});
}

void CellGrid::set(int line, int column, std::string text, Style style)
{
    if (line < 0 || line >= _lines || column < 0 || column >= _columns)
        return;
    Cell& cell = _cells[static_cast<std::size_t>(line) * static_cast<std::size_t>(_columns) +
                        static_cast<std::size_t>(column)];
    // The other half of a wide character that is overwritten must not stay alone.
    if (cell.text.empty() && !text.empty() && column > 0)
        (&cell)[-1].text = " ";
    if (!cell.text.empty() && column + 1 < _columns && (&cell)[1].text.empty())
        (&cell)[1].text = " ";
    cell = {std::move(text), style};
}

} // namespace orvane
