#include "platform/base/JsonText.h"

#include "platform/base/Utf8.h"

#include <cstdio>

namespace orvane
{

namespace
{

void appendEscaped(std::string& to, char character)
{
    switch (character) {
    case '"':
        to += "\\\"";
        return;
    case '\\':
        to += "\\\\";
        return;
    case '\n':
        to += "\\n";
        return;
    case '\r':
        to += "\\r";
        return;
    case '\t':
        to += "\\t";
        return;
    default:
        break;
    }
    if (static_cast<unsigned char>(character) >= 0x20) {
        to += character;
        return;
    }
    char escape[8];
    std::snprintf(escape, sizeof escape, "\\u%04x",
                  static_cast<unsigned>(static_cast<unsigned char>(character)));
    to += escape;
}

} // namespace

void appendJsonString(std::string& to, std::string_view text)
{
    std::string replaced;
    if (!isValidUtf8(text)) {
        replaced = validText(text);
        text = replaced;
    }
    to += '"';
    for (const char character : text)
        appendEscaped(to, character);
    to += '"';
}

} // namespace orvane
