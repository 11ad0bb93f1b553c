#include "platform/Console.h"

#include "platform/Services.h"

#include <cstdarg>
#include <cstdio>
#include <string>

namespace orvane
{

void StandardErrorConsole::writeLine(std::string_view line)
{
    std::string text(line);
    text += '\n';
    std::fwrite(text.data(), 1, text.size(), stderr);
}

void consoleLine(const char* format, ...)
{
    std::va_list arguments;
    va_start(arguments, format);
    std::va_list again;
    va_copy(again, arguments);
    const int length = std::vsnprintf(nullptr, 0, format, arguments);
    va_end(arguments);
    if (length >= 0) {
        std::string text(static_cast<std::size_t>(length), '\0');
        std::vsnprintf(text.data(), text.size() + 1, format, again);
        Services::current().console().writeLine(text);
    }
    va_end(again);
}

} // namespace orvane
