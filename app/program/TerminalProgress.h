#pragma once

#include "platform/services/ProgressLine.h"

#include <memory>
#include <string>

namespace orvane
{

// A progress line on standard error, where that is a terminal that standard output does not write
// on as well; null else.
std::unique_ptr<ProgressLine> progressOnTerminal(const std::string& task);

} // namespace orvane
