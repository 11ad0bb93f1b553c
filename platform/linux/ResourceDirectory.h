#pragma once

#include <string>

namespace orvane
{

// Where the application's resources are: as installed, the directory `share` (relative to the one
// that holds the program's own), else `sourceDirectory`, as run from the build.
std::string resourceDirectory(const std::string& share, const std::string& sourceDirectory);

} // namespace orvane
