#pragma once

#include "recordings/LogPlay.h"

namespace orvane
{

// Goes through a log once, from its start to its end, and stops at the end of each refresh period
// that has items: what a live view that refreshes so often would have shown. Periods are counted
// from the first item's time.
class RefreshPeriods
{
public:
    enum class Reached {
        Nothing, // the slice is over: call again
        Period,  // play() is at the end of a period
        End,     // no further period
    };

    // `period` is more than 0.
    RefreshPeriods(std::shared_ptr<ByteSource> log, const std::string& technology, LogTime period);

    // Goes on for a slice of some milliseconds, or to the next period's end.
    Reached takeSlice();

    // The time of the period's last item, and what is shown at its end.
    [[nodiscard]] LogTime time() const { return _play.time(); }
    [[nodiscard]] const LogPlay& play() const { return _play; }

private:
    LogPlay _play;
    LogTime _period;
    bool _isOpen = false; // items of the period that is under way have been taken
};

} // namespace orvane
