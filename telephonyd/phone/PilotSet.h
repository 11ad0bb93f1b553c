#pragma once

#include "telephonyd/phone/CDMAAir.h"

#include <chrono>
#include <vector>

namespace orvane
{

// The active set: the cells that a phone on CDMA receives at the same time, in the order in which
// they were added. An idle phone has the serving cell alone. While it is connected, other cells are
// added when their pilot is strong and removed when it has been weak for a while.
class PilotSet
{
public:
    using Strength = double (CDMAAir::*)(std::size_t cell) const;
    static constexpr std::size_t kMostCells = 6;

    // Pilot strengths in dB: cells are added from `comesInAt` on, and removed below `goesOutBelow`.
    PilotSet(Strength strength, double comesInAt, double goesOutBelow)
        : _strength(strength), _comesInAt(comesInAt), _goesOutBelow(goesOutBelow)
    {
    }

    // Advances by Drive::kStep. Returns whether cells were added or removed.
    bool step(const CDMAAir& air, std::size_t serving, bool isConnected);
    [[nodiscard]] const std::vector<std::size_t>& cells() const { return _cells; }

private:
    [[nodiscard]] bool isKept(const CDMAAir& air, std::size_t cell);

    Strength _strength;
    double _comesInAt;
    double _goesOutBelow;
    std::vector<std::size_t> _cells;
    std::array<std::chrono::milliseconds, kCDMATownCells> _weakFor{};
};

} // namespace orvane
