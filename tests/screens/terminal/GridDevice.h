#pragma once

#include "screens/terminal/TerminalDevice.h"

#include <deque>
#include <string>

namespace orvane
{

// A terminal that keeps the last grid shown, and returns the keys that a test presses.
class GridDevice final : public TerminalDevice
{
public:
    GridDevice(int lines, int columns) : _lines(lines), _columns(columns) {}

    [[nodiscard]] int lines() const override { return _lines; }
    [[nodiscard]] int columns() const override { return _columns; }
    [[nodiscard]] bool hasMarks() const override { return isBeautiful; }
    void show(const CellGrid& grid, CursorPlace cursor) override
    {
        shown = grid;
        shownCursor = cursor;
    }
    std::optional<Key> readKey() override
    {
        if (keys.empty())
            return std::nullopt;
        const Key key = keys.front();
        keys.pop_front();
        return key;
    }
    [[nodiscard]] bool isGone() const override { return isHungUp; }
    void updateSize() override
    {
        _lines = nextLines;
        _columns = nextColumns;
    }
    void suspend() override { ++suspensions; }
    void retake() override { ++retakes; }

    [[nodiscard]] std::string text(int line) const { return shown.text(line); }
    // All lines except the empty ones at the end.
    [[nodiscard]] std::string screen() const
    {
        std::string all;
        for (int line = 0; line < shown.lines(); ++line)
            all += text(line) + "\n";
        return all;
    }
    // The number of the line that contains the text; -1 if there is none.
    [[nodiscard]] int lineOf(const std::string& part) const
    {
        for (int line = 0; line < shown.lines(); ++line)
            if (text(line).find(part) != std::string::npos)
                return line;
        return -1;
    }

    CellGrid shown;
    CursorPlace shownCursor;
    std::deque<Key> keys;
    bool isBeautiful = true;
    bool isHungUp = false;
    int nextLines = 0;
    int nextColumns = 0;
    int retakes = 0;
    int suspensions = 0;

private:
    int _lines;
    int _columns;
};

} // namespace orvane
