#pragma once

#include "app/program/FrontEnd.h"

#include <memory>

namespace orvane
{

// The screen in the terminal of standard input and output. The loop must outlive it. Throws
// std::runtime_error with a line for the user if there is no such terminal.
std::unique_ptr<FrontEnd> makeTerminalFrontEnd(const AppOptions& options, QtEventLoop& loop);

} // namespace orvane
