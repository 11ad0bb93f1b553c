#include "LogGenerator/Formats.h"

#include "platform/base/FormatText.h"

#include <charconv>
#include <cstdarg>
#include <utility>

namespace orvane
{

namespace
{

RowText textOf(const char* begin, const char* end, std::string_view unit)
{
    RowText text(std::in_place, begin, end);
    text->append(unit);
    return text;
}

} // namespace

std::string printed(const char* format, ...)
{
    std::va_list arguments;
    va_start(arguments, format);
    std::string text = formatText(format, arguments).value_or("");
    va_end(arguments);
    return text;
}

RowText wholeNumber(std::int64_t value, std::string_view unit)
{
    char text[20];
    return textOf(text, std::to_chars(text, text + sizeof text, value).ptr, unit);
}

RowText fixedPoint(double value, int digits, std::string_view unit)
{
    // The longest double has 309 digits before its point.
    char text[1 + 309 + 1 + kMostDigits];
    const auto end =
        std::to_chars(text, text + sizeof text, value, std::chars_format::fixed, digits).ptr;
    return textOf(text, end, unit);
}

RowText decimal(std::int64_t raw) { return wholeNumber(static_cast<std::int32_t>(raw)); }

RowText unsignedDecimal(std::int64_t raw) { return wholeNumber(static_cast<std::uint32_t>(raw)); }

RowText decibels(std::int64_t raw) { return wholeNumber(static_cast<std::int32_t>(raw), " dB"); }

RowText decibelMilliwatts(std::int64_t raw)
{
    return wholeNumber(static_cast<std::int32_t>(raw), " dBm");
}

} // namespace orvane
