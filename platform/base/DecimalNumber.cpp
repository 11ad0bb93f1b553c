#include "platform/base/DecimalNumber.h"

#include <charconv>
#include <cmath>

namespace orvane
{

std::optional<double> decimalNumber(std::string_view text)
{
    double number = 0;
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number);
    if (error != std::errc() || stop != end || !std::isfinite(number))
        return std::nullopt;
    return number;
}

} // namespace orvane
