#pragma once

#include "recordings/LogDecoder.h"

#include <cstddef>
#include <cstdint>
#include <vector>

namespace orvane
{

// Places along a log from which a play can go on, so that any place is reached by decoding a small
// part of the log. Their number and memory are bounded: when there are too many, every second one
// is given up, and the next ones are taken twice as far apart.
class Checkpoints
{
public:
    static constexpr std::size_t kMost = 256;
    static constexpr std::size_t kMostBytes = 32 << 20;

    // Takes a checkpoint if it is time for one. Call at the log's start and after every item.
    void pass(const LogDecoder& decoder);

    // The last one whose items are all of earlier times than `time`; the log's start if there is no
    // other. Null before the first call of pass().
    [[nodiscard]] const LogDecoder::Checkpoint* before(LogTime time) const;
    // The last one at which the serving cell had changed no more often than that.
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
