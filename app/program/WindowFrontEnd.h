#pragma once

#include "app/program/FrontEnd.h"

#include <memory>

namespace orvane
{

// Shows the panes in a window and takes the user's input. Needs a QtWindowApplication. The loop
// must outlive the front end.
std::unique_ptr<FrontEnd> makeWindowFrontEnd(const AppOptions& options, QtEventLoop& loop);

} // namespace orvane
