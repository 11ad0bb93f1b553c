#pragma once

#include <cstdarg>
#include <optional>
#include <string>

namespace orvane
{

// What vprintf would write, as a text of any length; nothing where it would fail (a wide character
// without a form in the locale). Takes the arguments as vprintf does: they are used up afterwards.
[[gnu::format(printf, 1, 0)]] std::optional<std::string> formatText(const char* format,
                                                                    std::va_list arguments);

} // namespace orvane
