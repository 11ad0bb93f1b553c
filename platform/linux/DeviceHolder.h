#pragma once

#include <string>

namespace orvane
{

// The other program that has the device open, as "NAME (process N)". Empty where none is found,
// which includes programs of users whose processes may not be looked into.
std::string programThatHolds(const std::string& devicePath);

} // namespace orvane
