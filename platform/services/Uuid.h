#pragma once

#include <optional>
#include <string>

namespace orvane
{

// A new random UUID as text, upper-case with hyphens; nullopt when the machine gives no random
// numbers.
std::optional<std::string> makeUuid();

} // namespace orvane
