#include "platform/base/Utf8.h"

#include <cstring>

namespace orvane
{

namespace
{

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

// U+FFFE and U+FFFF, which no XML holds.
bool isNoCharacter(std::string_view sequence)
{
    return sequence == "\xEF\xBF\xBE" || sequence == "\xEF\xBF\xBF";
}

bool isLineEnd(char32_t character)
{
    return (character >= '\n' && character <= '\r') || character == 0x85 || character == 0x2028 ||
           character == 0x2029;
}

bool isDirectionControl(char32_t character)
{
    return character == 0x061C || character == 0x200E || character == 0x200F ||
           (character >= 0x202A && character <= 0x202E) ||
           (character >= 0x2066 && character <= 0x2069);
}

// Calls `append` for each whole character and puts U+FFFD in place of each other byte.
template <typename Append>
std::string transformed(std::string_view text, Append append)
{
    std::string result;
    result.reserve(text.size());
    while (!text.empty()) {
        const std::size_t length = utf8CharacterLength(text);
        if (length == 0)
            result += kReplacement;
        else
            append(result, text.substr(0, length));
        text.remove_prefix(length == 0 ? 1 : length);
    }
    return result;
}

} // namespace

std::size_t utf8CharacterLength(std::string_view text)
{
    if (text.empty())
        return 0;
    const auto byteAt = [text](std::size_t at) { return static_cast<unsigned char>(text[at]); };
    const unsigned first = byteAt(0);
    std::size_t length = 0;
    // The second byte's range excludes overlong forms, surrogates and what is beyond U+10FFFF.
    unsigned lowest = 0x80;
    unsigned highest = 0xBF;
    if (first < 0x80)
        return 1;
    if (first >= 0xC2 && first <= 0xDF) {
        length = 2;
    } else if (first >= 0xE0 && first <= 0xEF) {
        length = 3;
        lowest = first == 0xE0 ? 0xA0 : lowest;
        highest = first == 0xED ? 0x9F : highest;
    } else if (first >= 0xF0 && first <= 0xF4) {
        length = 4;
        lowest = first == 0xF0 ? 0x90 : lowest;
        highest = first == 0xF4 ? 0x8F : highest;
    } else {
        return 0;
    }
    if (text.size() < length || byteAt(1) < lowest || byteAt(1) > highest)
        return 0;
    for (std::size_t i = 2; i < length; ++i)
        if (!isUtf8Continuation(text[i]))
            return 0;
    return length;
}

void appendUtf8(std::string& to, std::uint32_t character)
{
    const auto add = [&to](std::uint32_t byte) { to += static_cast<char>(byte); };
    if (character < 0x80) {
        add(character);
    } else if (character < 0x800) {
        add(0xC0 | character >> 6);
        add(0x80 | (character & 0x3F));
    } else if (character < 0x10000) {
        add(0xE0 | character >> 12);
        add(0x80 | (character >> 6 & 0x3F));
        add(0x80 | (character & 0x3F));
    } else {
        add(0xF0 | character >> 18);
        add(0x80 | (character >> 12 & 0x3F));
        add(0x80 | (character >> 6 & 0x3F));
        add(0x80 | (character & 0x3F));
    }
}

bool isValidUtf8(std::string_view text)
{
    while (!text.empty()) {
        // Nearly all texts are ASCII: eight bytes at a time as long as they are.
        std::uint64_t word = 0;
        if (text.size() >= sizeof word) {
            std::memcpy(&word, text.data(), sizeof word);
            if ((word & 0x8080808080808080U) == 0) {
                text.remove_prefix(sizeof word);
                continue;
            }
        }
        const std::size_t length = utf8CharacterLength(text);
        if (length == 0)
            return false;
        text.remove_prefix(length);
    }
    return true;
}

std::string validText(std::string_view text)
{
    return transformed(text, [](std::string& to, std::string_view sequence) { to += sequence; });
}

std::string shownText(std::string_view text)
{
    return transformed(text, [](std::string& to, std::string_view sequence) {
        const auto first = static_cast<unsigned char>(sequence.front());
        if (first < 0x80 && first != '\t' && isControlCharacter(first))
            to += ' ';
        else
            to += isNoCharacter(sequence) ? kReplacement : sequence;
    });
}

char32_t utf8Character(std::string_view text, std::size_t length)
{
    const auto byteAt = [text](std::size_t at) { return static_cast<unsigned char>(text[at]); };
    if (length <= 1)
        return byteAt(0);
    // The first byte has 5, 4 or 3 bits of the character, each other one 6.
    char32_t character = byteAt(0) & (0x7FU >> length);
    for (std::size_t i = 1; i < length; ++i)
        character = character << 6 | (byteAt(i) & 0x3FU);
    return character;
}

bool isControlCharacter(char32_t character)
{
    return character < 0x20 || (character >= 0x7F && character <= 0x9F);
}

std::string printableText(std::string_view text)
{
    return transformed(text, [](std::string& to, std::string_view sequence) {
        const char32_t character = utf8Character(sequence, sequence.size());
        if (character == '\t' || isLineEnd(character))
            to += ' ';
        else if (isControlCharacter(character) || isNoCharacter(sequence))
            to += kReplacement;
        else if (!isDirectionControl(character))
            to += sequence;
    });
}

} // namespace orvane
