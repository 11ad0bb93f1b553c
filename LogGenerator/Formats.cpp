#include "LogGenerator/Formats.h"

#include "platform/FormatText.h"

#include <charconv>
#include <cstdarg>

namespace orvane
{

std::string printed(const char* format, ...)
{
    std::va_list arguments;
    va_start(arguments, format);
    std::string text = formatText(format, arguments).value_or("");
    va_end(arguments);
    return text;
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
