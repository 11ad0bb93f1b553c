#pragma once

#include "telephonyd/phone/PhoneRandom.h"

#include <chrono>

namespace orvane
{

// The states of the connection between a phone and a UMTS radio network, by the numbers under which
// modems report them.
enum class RadioState : std::uint8_t {
    Idle = 0,
    Connecting = 1,
    CellFach = 2, // connected, on the shared channels
    CellDch = 3,  // connected, on channels of its own
    CellPch = 4,  // connected but asleep; the network knows the cell
    UraPch = 5,   // connected but asleep; the network knows the registration area
};

// A connection that is made, used, let go to sleep or not, and released, again and again.
class RadioConnection
{
public:
    // Begins idle.
    explicit RadioConnection(std::uint64_t seed);

    [[nodiscard]] RadioState state() const;
    // How often a connection has got channels of its own.
    [[nodiscard]] unsigned transfers() const { return _transfers; }
    // Goes on to `now`, which never goes back, by one state at most. Returns whether it did.
    bool advance(std::chrono::milliseconds now);
    // An idle connection is wanted now: the next advance() makes it.
    void connect(std::chrono::milliseconds now);
    // Becomes idle (the phone has left the network or been sent away) and stays so for a while.
    void release(std::chrono::milliseconds now);

private:
    std::chrono::milliseconds length();

    PhoneRandom _random;
    std::size_t _place = 0; // in the round of states
    unsigned _transfers = 0;
    std::chrono::milliseconds _end{0};
};

} // namespace orvane
