#pragma once

#include "screens/terminal/Canvas.h"
#include "screens/toolkit/ViewController.h"

namespace orvane
{

// The toolbar of a controller as a line of text.

// Draws its views from the left. Returns the column after them.
int drawToolbar(Canvas& canvas, int line, const ViewController& controller);
// Whether it has a busy indicator that turns.
bool isBusy(const ViewController& controller);
// Its Save button; null if there is none.
const BarButtonItem* saveItem(const ViewController& controller);

} // namespace orvane
