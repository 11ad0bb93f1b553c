#pragma once

#include "screens/terminal/HeldErrors.h"

#include <array>
#include <csignal>
#include <string_view>
#include <termios.h>
#include <vector>

namespace orvane
{

// Sees to it that the terminal is given back also when the process crashes, aborts or exits
// somewhere deep: on every signal that would end the process and that nobody handles, writes what
// restores the terminal, sets its modes, lets the held error lines out, and lets the signal go on.
// One at a time.
class RestoreGuard
{
public:
    // Remembers the modes that the terminal has now.
    explicit RestoreGuard(int terminal);
    ~RestoreGuard();
    RestoreGuard(const RestoreGuard&) = delete;
    RestoreGuard& operator=(const RestoreGuard&) = delete;

    // From here on the screen is the terminal's: `restoring` is what makes it plain again, cut
    // after 512 bytes.
    void arm(std::string_view restoring);
    // The terminal has been given back; the held lines come out.
    void disarm();
    // Remembers the modes anew.
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
    std::vector<char> _handlerStack; // also for a stack that has run over
};

} // namespace orvane
