#pragma once

#include "screens/terminal/TerminalDevice.h"

#include <chrono>
#include <memory>
#include <optional>

namespace orvane
{

// Reads keys with ncurses, which must have been started.
class CursesKeys
{
public:
    CursesKeys();
    ~CursesKeys();
    CursesKeys(const CursesKeys&) = delete;
    CursesKeys& operator=(const CursesKeys&) = delete;

    // The next key that has arrived; nullopt if none has.
    std::optional<Key> read();
    // Treats the next characters as typed, not as pasted.
    void endPaste() { _isPasting = false; }
    // Whether the terminal reports clicks.
    [[nodiscard]] bool hasMouse() const { return _hasMouse; }

private:
    struct Pad;
    Key keyOfCode(int code);
    Key keyOfCharacter(char32_t character);
    Key readAfterEscape();
    void skipString();

    std::unique_ptr<Pad> _pad;
    bool _hasMouse = false;
    bool _isPasting = false;
    std::chrono::steady_clock::time_point _lastRead;
};

} // namespace orvane
