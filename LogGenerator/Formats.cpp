#include "LogGenerator/Formats.h"

#include <charconv>
#include <cstdarg>
#include <cstdio>

namespace orvane
{

std::string printed(const char* format, ...)
{
    char text[128];
    std::va_list arguments;
    va_start(arguments, format);
    std::va_list again;
    va_copy(again, arguments);
    const int length = std::vsnprintf(text, sizeof text, format, arguments);
    va_end(arguments);
    std::string result;
    if (length >= 0 && static_cast<std::size_t>(length) < sizeof text) {
        result.assign(text, static_cast<std::size_t>(length));
    } else if (length > 0) {
        result.resize(static_cast<std::size_t>(length));
        std::vsnprintf(result.data(), result.size() + 1, format, again);
    }
    va_end(again);
    return result;
}

RowText decimal(std::int64_t raw)
{
    // What "%d" prints, without the cost of parsing a format for the most frequent of all rows.
    char text[16];
    const auto end = std::to_chars(text, text + sizeof text, static_cast<std::int32_t>(raw)).ptr;
    return std::string(text, end);
}

RowText unsignedDecimal(std::int64_t raw) { return printed("%u", static_cast<std::uint32_t>(raw)); }

RowText decibels(std::int64_t raw) { return printed("%d dB", static_cast<std::int32_t>(raw)); }

RowText decibelMilliwatts(std::int64_t raw)
{
    return printed("%d dBm", static_cast<std::int32_t>(raw));
}

} // namespace orvane
