#pragma once

#include <string>

namespace orvane
{

// The path of a file below tests/data.
std::string testDataPath(const std::string& fileName);
// The folder of the shipped resources.
std::string shippedResourcesPath();

} // namespace orvane
