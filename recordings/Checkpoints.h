#pragma once

#include "recordings/LogDecoder.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace orvane
{

// Places in a log from which decoding can continue, so that any place is reached by decoding a
// small part of the log. Their number and memory are bounded: when there are too many, every second
// one is removed, and the next ones are taken twice as far apart.
class Checkpoints
{
public:
    static constexpr std::size_t kMost = 256;
    static constexpr std::size_t kMostBytes = 32 << 20;

    // Takes a checkpoint if it is time for one. Call at the log's start and after every item.
    void pass(const LogDecoder& decoder);

    // The last checkpoint whose items are all earlier than `time`; if there is none, the start of
    // the log. Null before the first call of pass().
    [[nodiscard]] const LogDecoder::Checkpoint* before(LogTime time) const;
    // The last checkpoint at which the serving cell had changed at most that often.
    [[nodiscard]] const LogDecoder::Checkpoint* withCellChanges(std::uint64_t most) const;

    [[nodiscard]] std::size_t size() const { return _all.size(); }
    // Items from one to the next.
    [[nodiscard]] std::uint64_t spacing() const { return _spacing; }

private:
    void thinOut();

    std::vector<LogDecoder::Checkpoint> _all;
    std::size_t _bytes = 0;
    std::uint64_t _spacing = 256;
};

} // namespace orvane
