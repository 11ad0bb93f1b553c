#pragma once

#include "screens/terminal/CellGrid.h"

#include <optional>

namespace orvane
{

// A key, a click or a pasted character.
struct Key {
    enum class Kind {
        Character, // `character`, control characters other than those below included
        Enter,
        Escape,
        Backspace,
        Delete,
        Tab,
        BackTab,
        Up,
        Down,
        Left,
        Right,
        PageUp,
        PageDown,
        Home,
        End,
        Click, // at `line` and `column`
        WheelUp,
        WheelDown,
        Pasted, // `character` is part of a text that was pasted
        Other,
    };
    Kind kind = Kind::Other;
    char32_t character = 0;
    int line = 0;
    int column = 0;
};

// Where on the grid the cursor stands.
struct CursorPlace {
    int line = 0;
    int column = 0;
    bool isVisible = false;
    friend bool operator==(const CursorPlace&, const CursorPlace&) = default;
};

// A terminal, as the screen uses it.
class TerminalDevice
{
public:
    virtual ~TerminalDevice() = default;
    [[nodiscard]] virtual int lines() const = 0;
    [[nodiscard]] virtual int columns() const = 0;
    // Whether it shows characters beyond ASCII, such as ⠋ and ›.
    [[nodiscard]] virtual bool hasMarks() const = 0;

    // Sends the differences to the grid shown before.
    virtual void show(const CellGrid& grid, CursorPlace cursor) = 0;
    // The next key that has arrived; nullopt if none has.
    virtual std::optional<Key> readKey() = 0;
    // Whether the other end has hung up.
    [[nodiscard]] virtual bool isGone() const = 0;

    // Reads the current size of the terminal.
    virtual void updateSize() = 0;
    // Gives the terminal back, stops the process as Ctrl-Z does, and takes the terminal again when
    // the process continues.
    virtual void suspend() = 0;
    // Takes the terminal again, whatever others have done to it, and sends everything again. Does
    // not take it while the process is in the background: then nothing is shown and no key is read.
    virtual void retake() = 0;
};

} // namespace orvane
