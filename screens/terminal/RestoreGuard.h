#pragma once

#include "screens/terminal/HeldErrors.h"

#include <array>
#include <csignal>
#include <string_view>
#include <termios.h>
#include <vector>

namespace orvane
{

// Restores the terminal also when the process crashes, aborts or exits anywhere. On every signal
// that would end the process and has no handler, it sends the restoring codes, sets the modes,
// releases the held error lines, and raises the signal again. One object at a time.
class RestoreGuard
{
public:
    // Remembers the current modes of the terminal.
    explicit RestoreGuard(int terminal);
    ~RestoreGuard();
    RestoreGuard(const RestoreGuard&) = delete;
    RestoreGuard& operator=(const RestoreGuard&) = delete;

    // The screen is up from now on. `restoring` are the codes that restore the terminal, of which
    // the first 512 bytes are used.
    void arm(std::string_view restoring);
    // The terminal has been restored. Releases the held lines.
    void disarm();
    // Remembers the modes again.
    void rememberModes();
    [[nodiscard]] HeldErrors& heldErrors() { return _heldErrors; }

private:
    struct Earlier {
        int signal;
        struct sigaction action;
    };

    static void handleSignal(int signal);
    static void handleExit();
    void restore();

    int _terminal;
    termios _modes{};
    std::array<char, 512> _restoring{};
    std::size_t _restoringSize = 0;
    volatile std::sig_atomic_t _isArmed = 0;
    HeldErrors _heldErrors;
    std::vector<Earlier> _earlier;
    std::vector<char> _handlerStack; // for handlers after a stack overflow
};

} // namespace orvane
