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

// The terminal as a screen of it needs it.
class TerminalDevice
{
public:
    virtual ~TerminalDevice() = default;
    [[nodiscard]] virtual int lines() const = 0;
    [[nodiscard]] virtual int columns() const = 0;
    // Whether it shows characters beyond ASCII, and among them marks such as ⠋ and ›.
    [[nodiscard]] virtual bool hasMarks() const = 0;

    // Sends what is different from what was shown before.
    virtual void show(const CellGrid& grid, CursorPlace cursor) = 0;
    // The next key that is there already.
    virtual std::optional<Key> readKey() = 0;
    // Whether nobody is at the other end any more.
    [[nodiscard]] virtual bool isGone() const = 0;

    // Takes over the size that the terminal has now.
    virtual void updateSize() = 0;
    // Gives the terminal back, stops the process as Ctrl-Z does, and retakes the terminal when the
    // process goes on.
    virtual void suspend() = 0;
    // Takes the terminal again, whatever others have done to it: everything is sent anew. Leaves it
    // to others while the process is in the background; then nothing is shown and no key read.
    virtual void retake() = 0;
};

} // namespace orvane
