#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

class CommandLine;

// The option --technology, by which a person names what a recording is of.
inline constexpr std::string_view kTechnologyOption = "technology";

// The technology constant; nothing where the option is not given, or, with the line's error set,
// names none.
std::optional<std::string> technologyFromOption(CommandLine& line);

} // namespace orvane
