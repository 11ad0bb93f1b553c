#pragma once

#include "platform/services/ProgressLine.h"

#include <memory>
#include <string>

namespace orvane
{

// A progress line on standard error. Null unless standard error is a terminal and standard output
// is not the same one.
std::unique_ptr<ProgressLine> progressOnTerminal(const std::string& task);

} // namespace orvane
