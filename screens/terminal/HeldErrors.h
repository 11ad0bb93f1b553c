#pragma once

#include <array>
#include <cstddef>

namespace orvane
{

// Keeps what the process writes to standard error (log lines, messages of libraries) from the
// screen of that same terminal, and lets it out when the screen is gone. Keeps the latest 64 KiB.
// One at a time.
class HeldErrors
{
public:
    HeldErrors() = default;
    ~HeldErrors() { release(); }
    HeldErrors(const HeldErrors&) = delete;
    HeldErrors& operator=(const HeldErrors&) = delete;

    // From here on nothing reaches the terminal; nothing happens where standard error is elsewhere,
    // or when the system has no more descriptors. Writers never wait.
    void hold(int terminal);
    // Makes room for more. To be called now and then.
    void collect();
    // Writes what was held to standard error, which is the terminal again. Safe in a signal's
    // handler, whatever the thread was doing.
    void release();

private:
    static constexpr std::size_t kMost = 64 * 1024;

    void writeHeld();

    std::array<char, kMost> _held{};
    std::size_t _start = 0;
    std::size_t _size = 0;
    bool _isIncomplete = false;
    int _terminal = -1; // standard error as it was; -1 while nothing is held
    int _readEnd = -1;
};

} // namespace orvane
