#pragma once

#include "LogGenerator/Field.h"
#include "platform/base/Reading.h"

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace orvane
{

// printf into a text.
[[gnu::format(printf, 1, 2)]] std::string printed(const char* format, ...);

// What printf makes of "%d" and "%.*f" (nearest even digit where the binary value lies just between
// two, as C has it), followed by the unit.
RowText wholeNumber(std::int64_t value, std::string_view unit = {});
RowText fixedPoint(double value, int digits, std::string_view unit = {});

// "%d" followed by the suffix, of raw * factor + offset (see Format::WholeScale).
constexpr Format wholeFormat(std::string_view suffix, const Format::WholeScale& scale = {})
{
    return Format::whole(suffix, scale);
}
// "%.*f" followed by the suffix, of raw * factor / divisor + offset.
constexpr Format fixedFormat(const Format::Scale& scale, int digits, std::string_view suffix = {})
{
    return Format::fixed(scale, digits, suffix);
}
// The same of a raw number that is the bits of a double (see bitsOfValue()).
constexpr Format realFormat(int digits, std::string_view suffix)
{
    return Format::fixed({}, digits, suffix).withValue(valueOfBits);
}
// The names of a table, the fallback for what it lacks. Without a fallback that writes no row.
constexpr Format namesFormat(std::span<const ValueName> names, const char* fallback)
{
    return Format::named(names, fallback);
}
// The names of a table; others show "Unknown".
template <const auto& Table>
inline constexpr Format named = namesFormat(Table, "Unknown");

// One name for 0 and one for every other raw number.
constexpr Format flagFormat(const char* zero, const char* others)
{
    return Format::named({}, others).withText(0, zero);
}

// Formats that several sections share, each called by its printf format.

// "%d": an unsigned 32-bit value beyond 2147483647 shows as C shows it, negative.
inline constexpr Format decimal = wholeFormat("");
// "%u".
inline constexpr Format unsignedDecimal =
    wholeFormat("", {.narrowing = Format::Narrowing::Unsigned32});
// "%d dB".
inline constexpr Format decibels = wholeFormat(" dB");
// "%d dBm".
inline constexpr Format decibelMilliwatts = wholeFormat(" dBm");

} // namespace orvane
