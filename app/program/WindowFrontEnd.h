#pragma once

#include "app/program/FrontEnd.h"

#include <memory>

namespace orvane
{

// Shows the panes in a window, which takes what a person does. Needs a QtWindowApplication; the
// loop is referred to and must outlive the front end.
std::unique_ptr<FrontEnd> makeWindowFrontEnd(const AppOptions& options, QtEventLoop& loop);

} // namespace orvane
