#include "platform/Utf8.h"

#include "platform/PropertyList.h"

namespace orvane
{

namespace
{

constexpr std::string_view kReplacement = "\xEF\xBF\xBD";

// The length that the first byte of a sequence announces, 0 for a byte that cannot begin one.
std::size_t announcedLength(unsigned char first)
{
    if (first < 0x80)
        return 1;
    if (first >= 0xC2 && first < 0xE0)
        return 2;
    if (first >= 0xE0 && first < 0xF0)
        return 3;
    return first >= 0xF0 && first < 0xF5 ? 4 : 0;
}

// U+FFFE and U+FFFF, which no XML holds.
bool isNoCharacter(std::string_view sequence)
{
    return sequence == "\xEF\xBF\xBE" || sequence == "\xEF\xBF\xBF";
}

bool isControl(unsigned char byte) { return (byte < 0x20 && byte != '\t') || byte == 0x7F; }

// Calls `append` for each whole character and puts U+FFFD in place of each other byte.
template <typename Append>
std::string transformed(std::string_view text, Append append)
{
    std::string result;
    result.reserve(text.size());
    for (std::size_t at = 0; at < text.size();) {
        const std::size_t length = announcedLength(static_cast<unsigned char>(text[at]));
        const std::string_view sequence = text.substr(at, length);
        if (length == 0 || sequence.size() < length || !isValidUtf8(sequence)) {
            result += kReplacement;
            ++at;
            continue;
        }
        append(result, sequence);
        at += length;
    }
    return result;
}

} // namespace

std::string validText(std::string_view text)
{
    return transformed(text, [](std::string& to, std::string_view sequence) { to += sequence; });
}

std::string shownText(std::string_view text)
{
    return transformed(text, [](std::string& to, std::string_view sequence) {
        if (isControl(static_cast<unsigned char>(sequence.front())))
            to += ' ';
        else
            to += isNoCharacter(sequence) ? kReplacement : sequence;
    });
}

} // namespace orvane
