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

// A connection that is made, used and released again and again. Some connections sleep before they
// are released.
class RadioConnection
{
public:
    // Begins idle.
    explicit RadioConnection(std::uint64_t seed);

    [[nodiscard]] RadioState state() const;
    // How often a connection has got channels of its own.
    [[nodiscard]] unsigned transfers() const { return _transfers; }
    // Advances to `now`, which never goes back, by at most one state. Returns whether the state
    // changed.
    bool advance(std::chrono::milliseconds now);
    // Asks for a connection: the next advance() begins one if there is none.
    void connect(std::chrono::milliseconds now);
    // Becomes idle, because the phone left the network or was sent away, and stays idle for a
    // while.
    void release(std::chrono::milliseconds now);

private:
    std::chrono::milliseconds length();

    PhoneRandom _random;
    std::size_t _place = 0; // in the round of states
    unsigned _transfers = 0;
    std::chrono::milliseconds _end{0};
};

} // namespace orvane
