#pragma once

#include "screens/terminal/Canvas.h"

#include <functional>
#include <string>
#include <vector>

namespace orvane
{

// The parts of the screen around the rows.

// One step of the way to what is shown.
struct Crumb {
    std::string title;
    std::function<void()> open; // by a click; null for none
};

// The path, shortened from the left where it does not fit, and what is said at the right.
void drawTitle(Canvas& canvas, int line, const std::vector<Crumb>& crumbs,
               const std::string& remark);

// As many of the hints as fit, the last two always if possible; `press` is told of clicks.
void drawHints(Canvas& canvas, int line, const std::vector<Hint>& hints,
               const std::function<void(const Key&)>& press);

// Paragraphs in the middle of empty lines, the first of them more important than the others.
void drawMessage(Canvas& canvas, Lines area, const std::vector<std::string>& paragraphs);

} // namespace orvane
