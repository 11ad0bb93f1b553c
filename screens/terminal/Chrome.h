#pragma once

#include "screens/terminal/Canvas.h"

#include <functional>
#include <string>
#include <vector>

namespace orvane
{

// The parts of the screen around the rows.

// One step of the path to the pane that is shown.
struct Crumb {
    std::string title;
    std::function<void()> open; // called by a click; null if a click does nothing
};

// Draws the path, shortened from the left if it does not fit, and the remark at the right.
void drawTitle(Canvas& canvas, int line, const std::vector<Crumb>& crumbs,
               const std::string& remark);

// Draws as many hints as fit, the last two first. Clicks on them call `press`.
void drawHints(Canvas& canvas, int line, const std::vector<Hint>& hints,
               const std::function<void(const Key&)>& press);

// Draws paragraphs in the middle of empty lines. The first one is the most important.
void drawMessage(Canvas& canvas, Lines area, const std::vector<std::string>& paragraphs);

} // namespace orvane
