#pragma once

#include "LogGenerator/Field.h"

#include <cstdint>
#include <span>
#include <string>
#include <string_view>

namespace orvane
{

// printf into a text.
[[gnu::format(printf, 1, 2)]] std::string printed(const char* format, ...);

// What printf makes of the most frequent formats, at a quarter of its cost: "%d" and "%.*f"
// (nearest even digit where the binary value lies just between two, as C has it), followed by the
// unit.
RowText wholeNumber(std::int64_t value, std::string_view unit = {});
constexpr int kMostDigits = 16;
RowText fixedPoint(double value, int digits, std::string_view unit = {});

// Names of a field's values.
struct ValueName {
    std::int64_t value;
    const char* name;
};

// The value's name, or the fallback for one that the table lacks.
constexpr const char* nameOf(std::span<const ValueName> table, std::int64_t value,
                             const char* fallback)
{
    for (const ValueName& entry : table)
        if (entry.value == value)
            return entry.name;
    return fallback;
}

// A format that names the values of a table; others show "Unknown".
template <const auto& Table>
RowText named(std::int64_t raw)
{
    return nameOf(Table, raw, "Unknown");
}

// Formats that several sections share, each named by its printf format.

// "%d": an unsigned 32-bit value beyond 2147483647 shows as C shows it, negative.
RowText decimal(std::int64_t raw);
// "%u".
RowText unsignedDecimal(std::int64_t raw);
// "%d dB".
RowText decibels(std::int64_t raw);
// "%d dBm".
RowText decibelMilliwatts(std::int64_t raw);

} // namespace orvane
