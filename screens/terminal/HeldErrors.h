#pragma once

#include <array>
#include <cstddef>

namespace orvane
{

// Holds back what the process writes to standard error (log lines, messages of libraries) while the
// screen is on the same terminal, and writes it when the screen is gone. Keeps the latest 64 KiB.
// One object at a time.
class HeldErrors
{
public:
    HeldErrors() = default;
    ~HeldErrors() { release(); }
    HeldErrors(const HeldErrors&) = delete;
    HeldErrors& operator=(const HeldErrors&) = delete;

    // Holds standard error back from now on. Does nothing if standard error is not that terminal,
    // or if the system has no more descriptors. Writers never wait.
    void hold(int terminal);
    // Takes over what was written, which makes room for more. To be called regularly.
    void collect();
    // Makes standard error the terminal again and writes what was held. Safe in a signal handler.
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
