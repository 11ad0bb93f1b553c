#pragma once

#include "recordings/LogDecoder.h"

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
        Period,  // decoder() is at the end of a period
        End,     // no further period
    };

    // `period` is more than 0.
    RefreshPeriods(std::shared_ptr<ByteSource> log, const std::string& technology, LogTime period);

    // Goes on for a slice of some milliseconds, or to the next period's end.
    Reached takeSlice();

    // The time of the period's last item, and what is shown at its end.
    [[nodiscard]] LogTime time() const { return _decoder.time(); }
    [[nodiscard]] const LogDecoder& decoder() const { return _decoder; }

    // How much of the log has been read, 0 to 1.
    [[nodiscard]] double progress() const;
    // What a person should know about what has been read: bytes that could not be placed, and
    // where.
    [[nodiscard]] std::string remark() const;

private:
    std::uint64_t _bytesAtFirst;
    LogDecoder _decoder;
    LogTime _period;
    bool _isOpen = false; // items of the period that is under way have been taken
};

} // namespace orvane
