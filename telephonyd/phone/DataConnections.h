#pragma once

#include "telephonyd/phone/Phases.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// A phone's data connections. The one for calls or messages stays; the one for the rest comes and
// goes, each time with a new address.
class DataConnections
{
public:
    enum class Network { LTE, BeforeLTE };

    // The one for the rest is up for times within `on` and down for times within `off`.
    DataConnections(Network network, Phases::Range on, Phases::Range off, std::uint64_t seed)
        : _network(network), _rest(on, off, true, seed)
    {
    }

    // Moves on to `now`, which never goes back. Returns whether a connection came or went.
    bool advance(std::chrono::milliseconds now);
    // The server's list of them.
    [[nodiscard]] PhoneMessage item() const;

private:
    Network _network;
    Phases _rest;
    unsigned _count = 1; // of the one for the rest, so far
};

} // namespace orvane
