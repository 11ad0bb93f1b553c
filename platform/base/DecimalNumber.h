#pragma once

#include <optional>
#include <string_view>

namespace orvane
{

// The whole text as a finite decimal number with '.' as its point, in any locale. Returns nullopt
// for any other text.
std::optional<double> decimalNumber(std::string_view text);

} // namespace orvane
