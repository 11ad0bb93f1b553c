#pragma once

#include <string>

namespace orvane
{

// Where the application's resources are: the share directory beside the program's own, as
// installed, else `sourceDirectory`, as run from the build.
std::string resourceDirectory(const std::string& sourceDirectory);

} // namespace orvane
