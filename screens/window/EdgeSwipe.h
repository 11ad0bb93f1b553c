#pragma once

#include <functional>

namespace orvane
{

// What a swipe from the left edge does. `begin` says whether there is anything to go back to;
// `move` gets the finger's way in points; `end` whether it let go on the way there.
struct EdgeSwipe {
    std::function<bool()> begin;
    std::function<void(double)> move;
    std::function<void(bool)> end;
};

} // namespace orvane
