#pragma once

#include <optional>
#include <string>

namespace orvane
{

// What keeps standard input and output from being a screen, and what to do about it; nothing where
// CursesDevice can show one.
std::optional<std::string> terminalProblem();

// What the kind of terminal that TERM names can do beyond what ncurses uses by itself, and what the
// user's locale allows. ncurses must have been started.
struct TerminalKind {
    TerminalKind();

    bool hasUtf8;        // the locale's characters are UTF-8
    bool isPlainConsole; // the system's own console, whose font has few characters
    // What turns the marking of pasted text on and off; empty where the terminal has no such thing.
    std::string pasteOn;
    std::string pasteOff;

    // What makes the terminal plain again without the help of ncurses.
    [[nodiscard]] std::string restoring(bool hasMouse) const;
    void send(const std::string& text) const;
};

} // namespace orvane
