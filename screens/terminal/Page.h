#pragma once

#include "screens/terminal/Canvas.h"

#include <vector>

namespace orvane
{

// One of the things that lie over each other on the screen; the one in front has the keys.
class Page
{
public:
    virtual ~Page() = default;
    virtual void draw(Canvas& canvas, Lines area) = 0;
    // False for a key that means nothing here.
    virtual bool take(const Key& key) = 0;
    // The most important first.
    [[nodiscard]] virtual std::vector<Hint> hints(const Marks& marks) const = 0;
    // Draws into the foot's line instead of the hints, if there is something to type there.
    virtual bool drawPrompt(Canvas&, int) { return false; }
};

} // namespace orvane
