#pragma once

#include "platform/PropertyValue.h"

#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

// The technology constant of the generator that knows most of the recording's items by their log
// codes; of equals the one with fewer codes of its own. Nothing when none knows any. Generators
// that need a template are asked only where the process's resources have it.
std::optional<std::string> technologyOfLog(ByteView file);

// The technology constant for its name on the command line: "lte", "umts", "utran", "cdma" or
// "cellmonitor". Nothing for any other text.
std::optional<std::string> technologyNamed(std::string_view name);
// All those names, as a text for people.
std::string technologyNames();

} // namespace orvane
