#include "telephonyd/phone/RadioConnection.h"

#include "telephonyd/phone/Phases.h"

#include <array>

namespace orvane
{

namespace
{

using std::chrono::milliseconds;

struct Stay {
    RadioState state;
    Phases::Range range;
};

constexpr Phases::Range kIdleFor{6, 14};
constexpr Phases::Range kConnectingFor{0.4, 1.2};
constexpr Phases::Range kDchFor{14, 26};
constexpr Phases::Range kFachFor{4, 8};
constexpr Phases::Range kAsleepFor{6, 12};

// Three connections: one that is released when it falls quiet, two that sleep before.
constexpr std::array<Stay, 16> kRound = {
    {
     {RadioState::Idle, kIdleFor},
     {RadioState::Connecting, kConnectingFor},
     {RadioState::CellDch, kDchFor},
     {RadioState::CellFach, kFachFor},
     {RadioState::Idle, kIdleFor},
     {RadioState::Connecting, kConnectingFor},
     {RadioState::CellDch, kDchFor},
     {RadioState::CellFach, kFachFor},
     {RadioState::CellPch, kAsleepFor},
     {RadioState::CellFach, kFachFor},
     {RadioState::CellDch, kDchFor},
     {RadioState::Idle, kIdleFor},
     {RadioState::Connecting, kConnectingFor},
     {RadioState::CellFach, kFachFor},
     {RadioState::UraPch, kAsleepFor},
     {RadioState::CellFach, kFachFor},
     }
};

} // namespace

RadioConnection::RadioConnection(std::uint64_t seed) : _random(seed) { _end = length(); }

RadioState RadioConnection::state() const { return kRound[_place].state; }

bool RadioConnection::advance(milliseconds now)
{
    if (now < _end)
        return false;
    _place = (_place + 1) % kRound.size();
    _transfers += state() == RadioState::CellDch ? 1 : 0;
    _end += length();
    return true;
}

void RadioConnection::connect(milliseconds now)
{
    if (state() == RadioState::Idle)
        _end = now;
}

void RadioConnection::release(milliseconds now)
{
    while (state() != RadioState::Idle)
        _place = (_place + 1) % kRound.size();
    _end = now + length();
}

milliseconds RadioConnection::length()
{
    const auto [least, most] = kRound[_place].range;
    return milliseconds(static_cast<int>(_random.between(least, most) * 1000) + 1);
}

} // namespace orvane
