#pragma once

#include <span>
#include <string>

namespace orvane
{

// What `orvane export` does with the arguments after that word. Returns the exit status; what is
// wrong has been told then.
int runExport(std::span<const std::string> arguments);

} // namespace orvane
