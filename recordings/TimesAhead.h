#pragma once

#include "dlf/DlfReader.h"
#include "recordings/LogTime.h"

#include <vector>

namespace orvane
{

// The timestamps of the next few items of a log. They decide whether the timestamp before them is
// plausible: time never goes back, so one corrupt timestamp would otherwise drag the rest of the
// log to it.
class TimesAhead
{
public:
    // A longer step from one item to the next is a leap.
    static constexpr LogTime kLongestStep = std::chrono::hours(24);

    // Reads the items that follow with its own copy of the reader, until three have a timestamp or
    // sixteen have been read.
    explicit TimesAhead(DlfReader reader);

    // Whether a log may begin at that timestamp: not if the next items agree on another day.
    [[nodiscard]] bool allowStart(std::uint64_t timestamp) const;
    // Whether time may leap to that timestamp from the time reached: not if most of the next items
    // are back at the time reached.
    [[nodiscard]] bool allowLeap(std::uint64_t timestamp, const LogClock& clock,
                                 LogTime reached) const;

private:
    std::vector<std::uint64_t> _timestamps;
};

} // namespace orvane
