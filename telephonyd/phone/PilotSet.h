#pragma once

#include "telephonyd/phone/CDMAAir.h"

#include <chrono>
#include <vector>

namespace orvane
{

// The cells that a phone on CDMA receives at the same time: its active set, the first to come in
// first. Idle it is the serving cell alone; in a connection others come in when their pilot is
// strong, and go out when it has been weak for a while.
class PilotSet
{
public:
    using Strength = double (CDMAAir::*)(std::size_t cell) const;
    static constexpr std::size_t kMostCells = 6;

    // Strengths in dB at which cells come in and below which they go out.
    PilotSet(Strength strength, double comesInAt, double goesOutBelow)
        : _strength(strength), _comesInAt(comesInAt), _goesOutBelow(goesOutBelow)
    {
    }

    // Goes on for Drive::kStep. Returns whether cells came or went.
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
