#include "screens/terminal/LineWidth.h"

#include "platform/base/Utf8.h"

#include <algorithm>
#include <cwchar>
#include <cwctype>
#include <locale.h> // NOLINT(modernize-deprecated-headers): newlocale() is not in <clocale>

namespace orvane
{

namespace
{

constexpr char32_t kReplacement = 0xFFFD;
// The number that ncurses keeps with one character.
constexpr std::size_t kMostCombining = 4;

// The C library knows the widths of all characters only in a locale with UTF-8. The user's locale
// may be another one.
class Utf8Locale
{
public:
    Utf8Locale() : _earlier(uselocale(locale())) {}
    ~Utf8Locale() { uselocale(_earlier); }
    Utf8Locale(const Utf8Locale&) = delete;
    Utf8Locale& operator=(const Utf8Locale&) = delete;

private:
    static locale_t locale()
    {
        static const locale_t utf8 = newlocale(LC_CTYPE_MASK, "C.UTF-8", nullptr);
        return utf8;
    }

    locale_t _earlier;
};

// Characters without a form of their own, such as joiners and variation selectors: terminals differ
// in how many columns a text with them takes.
bool isInvisible(char32_t character)
{
    return character == 0xAD || (character >= 0x200B && character <= 0x200D) ||
           (character >= 0x2060 && character <= 0x206F) ||
           (character >= 0xFE00 && character <= 0xFE0F) || character == 0xFEFF ||
           (character >= 0xE0000 && character <= 0xE0FFF);
}

std::u32string lowered(std::string_view text)
{
    std::u32string result = decoded(text);
    const Utf8Locale utf8;
    for (char32_t& character : result)
        character = static_cast<char32_t>(std::towlower(static_cast<std::wint_t>(character)));
    return result;
}

} // namespace

std::u32string decoded(std::string_view text)
{
    std::u32string result;
    while (!text.empty()) {
        const std::size_t length = utf8CharacterLength(text);
        result += length == 0 ? kReplacement : utf8Character(text, length);
        text.remove_prefix(length == 0 ? 1 : length);
    }
    return result;
}

std::string encoded(std::u32string_view text)
{
    std::string result;
    for (const char32_t character : text)
        appendUtf8(result, character);
    return result;
}

int columnsOf(char32_t character)
{
    if (character >= 0x20 && character < 0x7F)
        return 1;
    if (character < 0x20)
        return -1;
    const Utf8Locale utf8;
    return ::wcwidth(static_cast<wchar_t>(character));
}

std::vector<Glyph> glyphsOf(std::string_view text)
{
    std::vector<Glyph> glyphs;
    std::size_t combining = 0;
    for (char32_t character : decoded(printableText(text))) {
        if (isInvisible(character))
            continue;
        int columns = columnsOf(character);
        if (columns < 0) {
            character = kReplacement;
            columns = 1;
        }
        if (columns > 0) {
            glyphs.push_back({encoded({&character, 1}), columns});
            combining = 0;
        } else if (glyphs.empty()) {
            glyphs.push_back({" " + encoded({&character, 1}), 1});
            combining = 1;
        } else if (++combining <= kMostCombining) {
            glyphs.back().text += encoded({&character, 1});
        }
    }
    return glyphs;
}

int columnsOf(std::string_view text)
{
    int columns = 0;
    for (const Glyph& glyph : glyphsOf(text))
        columns += glyph.columns;
    return columns;
}

std::string shortened(std::string_view text, int columns, std::string_view mark)
{
    const std::vector<Glyph> glyphs = glyphsOf(text);
    std::string fitting;
    std::string fittingWithMark;
    int taken = 0;
    const int markColumns = columnsOf(mark);
    for (const Glyph& glyph : glyphs) {
        if (taken + markColumns <= columns)
            fittingWithMark = fitting;
        taken += glyph.columns;
        if (taken > columns)
            return columns < markColumns ? "" : fittingWithMark + std::string(mark);
        fitting += glyph.text;
    }
    return fitting;
}

std::vector<std::string> wrapped(std::string_view text, int columns)
{
    std::vector<std::string> lines;
    std::string line;
    std::string word;
    int lineColumns = 0;
    int wordColumns = 0;
    const auto endLine = [&] {
        lines.push_back(line);
        line.clear();
        lineColumns = 0;
    };
    const auto endWord = [&] {
        if (word.empty())
            return;
        if (!line.empty() && lineColumns + 1 + wordColumns > columns)
            endLine();
        line += (line.empty() ? "" : " ") + word;
        lineColumns += wordColumns + (lineColumns > 0 ? 1 : 0);
        word.clear();
        wordColumns = 0;
    };
    for (const Glyph& glyph : glyphsOf(text)) {
        if (glyph.text == " ") {
            endWord();
            continue;
        }
        // A word that is longer than a line is broken at the edge.
        if (wordColumns > 0 && wordColumns + glyph.columns > columns)
            endWord();
        word += glyph.text;
        wordColumns += glyph.columns;
    }
    endWord();
    if (!line.empty())
        endLine();
    return lines;
}

bool containsIgnoringCase(std::string_view text, std::string_view part)
{
    return part.empty() || lowered(text).find(lowered(part)) != std::u32string::npos;
}

} // namespace orvane
