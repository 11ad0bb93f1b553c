#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace orvane
{

// Whether the bytes are well-formed UTF-8 (no surrogates, nothing beyond U+10FFFF).
bool isValidUtf8(std::string_view text);

// The length in bytes of the well-formed character that the text starts with, 1 to 4; 0 where it
// starts with none.
std::size_t utf8CharacterLength(std::string_view text);

// Whether the byte is one of a character's second to fourth bytes.
constexpr bool isUtf8Continuation(char byte)
{
    return (static_cast<unsigned char>(byte) & 0xC0) == 0x80;
}

// Appends a Unicode character, at most U+10FFFF and not a surrogate.
void appendUtf8(std::string& to, std::uint32_t character);

// The text with every byte that is not part of well-formed UTF-8 replaced by U+FFFD.
std::string validText(std::string_view text);

// The text made fit for one line of a screen and for XML: every byte that is not part of
// well-formed UTF-8, U+FFFE and U+FFFF become U+FFFD; every control character but the tab becomes a
// blank.
std::string shownText(std::string_view text);

} // namespace orvane
