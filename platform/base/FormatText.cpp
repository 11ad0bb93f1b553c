#include "platform/base/FormatText.h"

#include <cstdio>

namespace orvane
{

std::optional<std::string> formatText(const char* format, std::va_list arguments)
{
    std::va_list again;
    va_copy(again, arguments);
    std::optional<std::string> text;
    char shortText[256];
    const int length = std::vsnprintf(shortText, sizeof shortText, format, arguments);
    if (length >= 0 && static_cast<std::size_t>(length) < sizeof shortText) {
        text.emplace(shortText, static_cast<std::size_t>(length));
    } else if (length >= 0) {
        text.emplace(static_cast<std::size_t>(length), '\0');
        std::vsnprintf(text->data(), text->size() + 1, format, again);
    }
    va_end(again);
    return text;
}

} // namespace orvane
