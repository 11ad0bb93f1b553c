#pragma once

#include "screens/terminal/TerminalDevice.h"

#include <chrono>
#include <memory>
#include <optional>

namespace orvane
{

// Reads keys by means of ncurses, which must have been started.
class CursesKeys
{
public:
    CursesKeys();
    ~CursesKeys();
    CursesKeys(const CursesKeys&) = delete;
    CursesKeys& operator=(const CursesKeys&) = delete;

    // The next key that is there already.
    std::optional<Key> read();
    // What is being pasted has ended, whatever comes.
    void endPaste() { _isPasting = false; }
    // Whether the terminal tells of clicks.
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
