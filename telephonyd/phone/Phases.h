#pragma once

#include "telephonyd/phone/PhoneRandom.h"

#include <chrono>

namespace orvane
{

// A state that is on and off by turns, for random times.
class Phases
{
public:
    struct Range {
        double leastSeconds;
        double mostSeconds;
    };

    // Begins on or off, with a first phase of a random length like all others.
    Phases(Range on, Range off, bool beginsOn, std::uint64_t seed)
        : _on(on), _off(off), _isOn(beginsOn), _random(seed)
    {
        _end = length();
    }

    [[nodiscard]] bool isOn() const { return _isOn; }
    // Advances to `now`, which never goes back. Returns whether the state changed on the way.
    bool advance(std::chrono::milliseconds now)
    {
        const bool before = _isOn;
        while (_end <= now) {
            _isOn = !_isOn;
            _end += length();
        }
        return _isOn != before;
    }

private:
    std::chrono::milliseconds length()
    {
        const Range range = _isOn ? _on : _off;
        return std::chrono::milliseconds(
            static_cast<int>(_random.between(range.leastSeconds, range.mostSeconds) * 1000) + 1);
    }

    Range _on;
    Range _off;
    bool _isOn;
    PhoneRandom _random;
    std::chrono::milliseconds _end{0};
};

} // namespace orvane
