#include "platform/services/Console.h"

#include "platform/base/FormatText.h"
#include "platform/base/Utf8.h"
#include "platform/services/Services.h"

#include <cstdarg>
#include <cstdio>
#include <string>

namespace orvane
{

void StreamConsole::writeLine(std::string_view line)
{
    std::string text = printableText(line);
    text += '\n';
    std::fwrite(text.data(), 1, text.size(), _stream);
}

void consoleLine(const char* format, ...)
{
    std::va_list arguments;
    va_start(arguments, format);
    if (const auto text = formatText(format, arguments))
        Services::current().console().writeLine(*text);
    va_end(arguments);
}

} // namespace orvane
