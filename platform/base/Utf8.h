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

// The text made fit for one line of a file and for XML: every byte that is not part of well-formed
// UTF-8, U+FFFE and U+FFFF become U+FFFD; every control character of ASCII but the tab becomes a
// blank. For a terminal use printableText().
std::string shownText(std::string_view text);

// The text as it may be sent to a terminal, on one line, whoever wrote it. Tabs and the ends of
// lines and paragraphs become blanks. The other control characters (C0, DEL, and C1 from U+0080 to
// U+009F), bytes that are not well-formed UTF-8, U+FFFE and U+FFFF become U+FFFD. Controls of the
// writing direction are left out: they could show a text in another order than it is in.
std::string printableText(std::string_view text);

// Whether the character is a control character: C0 (U+0000 to U+001F), DEL, or C1 (U+0080 to
// U+009F).
bool isControlCharacter(char32_t character);

// The character that the text starts with; the text starts with `length` bytes of well-formed UTF-8
// for one character (utf8CharacterLength), 1 to 4.
char32_t utf8Character(std::string_view text, std::size_t length);

} // namespace orvane
