#pragma once

#include "screens/terminal/Canvas.h"
#include "screens/toolkit/ViewController.h"

namespace orvane
{

// A controller's toolbar as a line of text.

// Draws its views from the left on and returns the column after them.
int drawToolbar(Canvas& canvas, int line, const ViewController& controller);
// Whether a busy indicator among them turns.
bool isBusy(const ViewController& controller);
// Its standard Save button; null for none.
const BarButtonItem* saveItem(const ViewController& controller);

} // namespace orvane
