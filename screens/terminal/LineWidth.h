#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// Texts measured in columns of a terminal: a wide character takes two, a combining one none. Glyphs
// are safe to send to a terminal: texts pass printableText() first, and characters that join others
// are left out.

// A character with the characters that combine with it.
struct Glyph {
    std::string text; // UTF-8
    int columns = 1;  // 1 or 2
};

// Takes any bytes. Bytes that are not UTF-8 become U+FFFD.
std::vector<Glyph> glyphsOf(std::string_view text);
int columnsOf(std::string_view text);
// The text in at most that many columns. If it was cut, it ends with `mark`.
std::string shortened(std::string_view text, int columns, std::string_view mark);
// Lines of at most that many columns, broken at blanks if possible.
std::vector<std::string> wrapped(std::string_view text, int columns);
// Whether `text` contains `part`, ignoring case.
bool containsIgnoringCase(std::string_view text, std::string_view part);

// Decodes well-formed UTF-8; anything else becomes U+FFFD.
std::u32string decoded(std::string_view text);
std::string encoded(std::u32string_view text);
// -1 for a character that must not be sent to a terminal.
int columnsOf(char32_t character);

} // namespace orvane
