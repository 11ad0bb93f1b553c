#include "platform/base/JsonText.h"

#include "platform/base/Utf8.h"

#include <algorithm>
#include <cstdio>

namespace orvane
{

namespace
{

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

// Empty for a character that has no short escape.
std::string_view shortEscape(char32_t character)
{
    switch (character) {
    case '"':
        return "\\\"";
    case '\\':
        return "\\\\";
    case '\n':
        return "\\n";
    case '\r':
        return "\\r";
    case '\t':
        return "\\t";
    default:
        return {};
    }
}

bool standsForItself(char character)
{
    return character >= 0x20 && character < 0x7F && character != '"' && character != '\\';
}

void appendCharacter(std::string& to, std::string_view sequence)
{
    const char32_t character = utf8Character(sequence, sequence.size());
    if (const std::string_view escape = shortEscape(character); !escape.empty()) {
        to += escape;
    } else if (isControlCharacter(character)) {
        char code[8];
        std::snprintf(code, sizeof code, "\\u%04x", static_cast<unsigned>(character) & 0xFFFFU);
        to += code;
    } else {
        to += sequence;
    }
}

} // namespace

void appendJsonString(std::string& to, std::string_view text)
{
    to += '"';
    while (!text.empty()) {
        // Nearly all of most texts stands for itself.
        const auto plain = std::find_if_not(text.begin(), text.end(), standsForItself);
        to.append(text.begin(), plain);
        text.remove_prefix(static_cast<std::size_t>(plain - text.begin()));
        if (text.empty())
            break;
        const std::size_t length = utf8CharacterLength(text);
        if (length == 0)
            to += kReplacement;
        else
            appendCharacter(to, text.substr(0, length));
        text.remove_prefix(length == 0 ? 1 : length);
    }
    to += '"';
}

} // namespace orvane
