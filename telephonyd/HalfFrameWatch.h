#pragma once

#include "platform/ports/FrameConnection.h"

#include <chrono>
#include <cstdint>
#include <optional>

namespace orvane
{

// How long a client may take to finish a frame, and to start a channel. The server looks at its
// connections in intervals, so that the end comes up to one interval later.
constexpr std::chrono::seconds kClientTimeout(30);
constexpr std::chrono::seconds kClientCheckInterval(5);
constexpr int kClientChecks = kClientTimeout / kClientCheckInterval;

// Finds out that the peer of one connection has begun a frame and does not finish it.
class HalfFrameWatch
{
public:
    // To be called once an interval. Returns whether a frame has been unfinished for the time.
    bool check(const FrameConnection& connection)
    {
        const auto frame = connection.unfinishedFrame();
        _checks = frame && frame == _frame ? _checks + 1 : 0;
        _frame = frame;
        return _checks >= kClientChecks;
    }

private:
    std::optional<std::uint64_t> _frame;
    int _checks = 0; // since that frame was first seen unfinished
};

} // namespace orvane
