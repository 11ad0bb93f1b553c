#pragma once

#include <string>

namespace orvane
{

// $XDG_RUNTIME_DIR; empty where it is not set or not absolute.
std::string runtimeDirectory();

} // namespace orvane
