#pragma once

#include "screens/terminal/Canvas.h"

#include <string>
#include <vector>

namespace orvane
{

// A key, or keys that belong together, in the list of keys.
struct KeyHelp {
    std::string keys;
    std::string what;
};

// One of the pages that lie over each other on the screen. The one in front gets the keys.
class Page
{
public:
    virtual ~Page() = default;
    virtual void draw(Canvas& canvas, Lines area) = 0;
    // False for a key that does nothing here.
    virtual bool take(const Key& key) = 0;
    // The keys that work now, the most important first.
    [[nodiscard]] virtual std::vector<Hint> hints(const Marks& marks) const = 0;
    // Draws a line to type in at the foot, in place of the hints. False where there is none now.
    virtual bool drawPrompt(Canvas&, int) { return false; }
};

} // namespace orvane
