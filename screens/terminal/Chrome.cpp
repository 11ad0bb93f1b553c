#include "screens/terminal/Chrome.h"

#include "screens/terminal/LineWidth.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr int kWidestMessage = 60;
constexpr int kGap = 2; // between hints

int columnsOf(const Hint& hint) { return orvane::columnsOf(hint.key + " " + hint.what); }

// The hints that fit: the last two, and of the others the first ones.
std::vector<Hint> fitting(std::vector<Hint> hints, int columns)
{
    constexpr std::size_t kAlways = 2;
    int taken = 0;
    for (const Hint& hint : hints)
        taken += columnsOf(hint) + (taken > 0 ? kGap : 0);
    while (taken > columns && hints.size() > kAlways) {
        const auto least = hints.end() - kAlways - 1;
        taken -= columnsOf(*least) + kGap;
        hints.erase(least);
    }
    return hints;
}

} // namespace

void drawTitle(Canvas& canvas, int line, const std::vector<Crumb>& crumbs,
               const std::string& remark)
{
    CellGrid& grid = canvas.grid;
    const Style strong{Ink::Bar, false};
    const Style quiet{Ink::BarQuiet, false};
    grid.fill(line, grid.wholeLine(), quiet);
    int end = grid.columns() - 1;
    if (!remark.empty()) {
        const std::string shown = shortened(remark, grid.columns() / 2, canvas.marks.cut);
        end -= columnsOf(shown);
        grid.put(line, end, shown, quiet);
        end -= 2;
    }

    const std::string separator = " " + canvas.marks.disclosure + " ";
    const int separatorColumns = columnsOf(separator);
    int column = 1;
    std::size_t first = crumbs.size();
    for (int needed = 0; first > 0; --first) {
        needed += columnsOf(crumbs[first - 1].title) + (needed > 0 ? separatorColumns : 0);
        const int before = first > 1 ? columnsOf(canvas.marks.cut) + separatorColumns : 0;
        if (needed + before > end - column && first < crumbs.size())
            break;
    }
    if (first > 0 && end - column > separatorColumns) {
        column = grid.put(line, column, canvas.marks.cut + separator, quiet);
        if (crumbs[first - 1].open)
            canvas.onClick({line, 1}, {0, column},
                           [open = crumbs[first - 1].open](int) { open(); });
    }
    for (std::size_t i = first; i < crumbs.size(); ++i) {
        const bool isLast = i + 1 == crumbs.size();
        const int start = column;
        column = grid.put(line, column, shortened(crumbs[i].title, end - column, canvas.marks.cut),
                          isLast ? strong : quiet);
        if (crumbs[i].open)
            canvas.onClick({line, 1}, {start, column}, [open = crumbs[i].open](int) { open(); });
        if (!isLast)
            column = grid.put(line, column, separator, quiet);
    }
}

void drawHints(Canvas& canvas, int line, const std::vector<Hint>& hints,
               const std::function<void(const Key&)>& press)
{
    int column = 1;
    for (const Hint& hint : fitting(hints, canvas.columns() - 1)) {
        const int start = column;
        column = canvas.grid.put(line, column, hint.key, {Ink::StatusKey, false});
        column = canvas.grid.put(line, column, " " + hint.what, {Ink::Status, false});
        canvas.onClick({line, 1}, {start, column}, [press, key = hint.press](int) { press(key); });
        column += kGap;
    }
}

void drawMessage(Canvas& canvas, Lines area, const std::vector<std::string>& paragraphs)
{
    std::vector<std::pair<std::string, Style>> lines;
    for (const std::string& paragraph : paragraphs) {
        const Style style{lines.empty() ? Ink::Plain : Ink::Quiet, false};
        if (!lines.empty() && area.count > 4)
            lines.emplace_back("", style);
        for (std::string& text :
             wrapped(paragraph, std::clamp(canvas.columns() - 4, 1, kWidestMessage)))
            lines.emplace_back(std::move(text), style);
    }
    const int count = std::min(static_cast<int>(lines.size()), area.count);
    // A little above the middle.
    int line = area.first + (area.count - count) * 2 / 5;
    for (int i = 0; i < count; ++i, ++line) {
        const auto& [text, style] = lines[static_cast<std::size_t>(i)];
        canvas.grid.put(line, (canvas.columns() - columnsOf(text)) / 2, text, style);
    }
}

} // namespace orvane
