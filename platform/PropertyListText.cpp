#include "platform/PropertyListText.h"

#include "platform/PropertyList.h"

#include <cstring>

namespace orvane
{

namespace
{

constexpr std::size_t kExcerptBytes = 40;

bool isContinuation(char byte) { return (static_cast<unsigned char>(byte) & 0xC0) == 0x80; }

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

// The length of the well-formed character that `text` starts with, or 0.
std::size_t characterLength(std::string_view text)
{
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
        if (!isContinuation(text[i]))
            return 0;
    return length;
}

} // namespace

Utf16Conversion utf8FromUtf16(ByteView bytes, std::endian order)
{
    const std::size_t high = order == std::endian::big ? 0 : 1;
    const auto unitAt = [bytes, high](std::size_t at) {
        return static_cast<std::uint32_t>(bytes[at + high] << 8 | bytes[at + 1 - high]);
    };
    std::string text;
    text.reserve(bytes.size() / 2);
    std::size_t at = 0;
    for (; bytes.size() - at >= 2; at += 2) {
        std::uint32_t character = unitAt(at);
        if (character >= 0xDC00 && character <= 0xDFFF)
            return {std::nullopt, at};
        if (character >= 0xD800 && character <= 0xDBFF) {
            if (bytes.size() - at < 4)
                return {std::nullopt, at};
            const std::uint32_t partner = unitAt(at + 2);
            if (partner < 0xDC00 || partner > 0xDFFF)
                return {std::nullopt, at};
            character = 0x10000 + ((character - 0xD800) << 10) + (partner - 0xDC00);
            at += 2;
        }
        appendUtf8(text, character);
    }
    if (at != bytes.size())
        return {std::nullopt, at};
    return {std::move(text), 0};
}

std::string quotedExcerpt(std::string_view text)
{
    std::size_t length = text.size();
    if (length > kExcerptBytes) {
        length = kExcerptBytes;
        while (length > 0 && isContinuation(text[length]))
            --length;
    }
    std::string quoted = "\"";
    for (const char character : text.substr(0, length))
        quoted += static_cast<unsigned char>(character) < 0x20 ? ' ' : character;
    return quoted + (length < text.size() ? "...\"" : "\"");
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
        const std::size_t length = characterLength(text);
        if (length == 0)
            return false;
        text.remove_prefix(length);
    }
    return true;
}

} // namespace orvane
