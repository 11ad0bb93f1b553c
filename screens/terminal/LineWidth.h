#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// Text measured in columns of a terminal, of which a wide character takes two and a combining one
// none. Everything here is safe to send to a terminal: control characters and what is no character
// come out as U+FFFD, tabs as blanks, and what would reorder or join characters not at all.

// A character with what combines with it.
struct Glyph {
    std::string text; // UTF-8
    int columns = 1;  // 1 or 2
};

// Any bytes; those that are no UTF-8 come out as U+FFFD.
std::vector<Glyph> glyphsOf(std::string_view text);
int columnsOf(std::string_view text);
// At most so many columns, the last of them `mark` where something had to be left out.
std::string shortened(std::string_view text, int columns, std::string_view mark);
// Lines of at most so many columns, broken at blanks where possible.
std::vector<std::string> wrapped(std::string_view text, int columns);
// Whether `part` occurs in `text`, whatever the case of either.
bool containsIgnoringCase(std::string_view text, std::string_view part);

// Decodes well-formed UTF-8; anything else becomes U+FFFD.
std::u32string decoded(std::string_view text);
std::string encoded(std::u32string_view text);
// -1 for what a terminal must not be sent.
int columnsOf(char32_t character);

} // namespace orvane
