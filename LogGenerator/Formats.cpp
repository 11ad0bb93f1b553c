#include "LogGenerator/Formats.h"

#include "platform/base/FormatText.h"

#include <cstdarg>
#include <utility>

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

RowText wholeNumber(std::int64_t value, std::string_view unit)
{
    RowText text(std::in_place);
    appendWhole(*text, value);
    *text += unit;
    return text;
}

RowText fixedPoint(double value, int digits, std::string_view unit)
{
    RowText text(std::in_place);
    appendFixed(*text, value, digits);
    *text += unit;
    return text;
}

} // namespace orvane
