#pragma once

#include "dlf/DlfReader.h"
#include "recordings/LogTime.h"

#include <vector>

namespace orvane
{

// The timestamps of the next few items of a log, which tell whether that of the item before them is
// to be believed: one that damage has made up would else take the whole log to its time, from where
// time never comes back.
class TimesAhead
{
public:
    // Farther than that from one item to the next is a leap.
    static constexpr LogTime kLongestStep = std::chrono::hours(24);

    // Takes the items that follow, of its own copy of the reader: three with a timestamp, if they
    // are near.
    explicit TimesAhead(DlfReader reader);

    // Whether a log may begin at that timestamp: not if the next items agree on some other day.
    [[nodiscard]] bool allowStart(std::uint64_t timestamp) const;
    // Whether time may leap to that timestamp, which is a leap from the time reached: not if the
    // next items are back by then.
    [[nodiscard]] bool allowLeap(std::uint64_t timestamp, const LogClock& clock,
                                 LogTime reached) const;

private:
    std::vector<std::uint64_t> _timestamps;
};

} // namespace orvane
