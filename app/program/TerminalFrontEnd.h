#pragma once

#include "app/program/FrontEnd.h"

#include <memory>

namespace orvane
{

// The screen of the terminal at standard input and output. The loop is referred to and must outlive
// it. Throws std::runtime_error with a line for the user where there is no such terminal.
std::unique_ptr<FrontEnd> makeTerminalFrontEnd(const AppOptions& options, QtEventLoop& loop);

} // namespace orvane
