#include "platform/plist/PropertyListText.h"

#include "platform/base/Utf8.h"

namespace orvane
{

namespace
{

constexpr std::size_t kExcerptBytes = 40;
constexpr std::uint32_t kReplacement = 0xFFFD;

constexpr bool isFirstSurrogate(std::uint32_t unit) { return unit >= 0xD800 && unit <= 0xDBFF; }
constexpr bool isSecondSurrogate(std::uint32_t unit) { return unit >= 0xDC00 && unit <= 0xDFFF; }

std::size_t utf8Length(std::uint32_t character)
{
    return character < 0x80 ? 1 : character < 0x800 ? 2 : character < 0x10000 ? 3 : 4;
}

// Calls `take` with each character, U+FFFD for what is malformed.
template <typename Take>
void eachCharacter(ByteView bytes, std::endian order, Take take)
{
    const std::size_t high = order == std::endian::big ? 0 : 1;
    const auto unitAt = [bytes, high](std::size_t at) {
        return static_cast<std::uint32_t>(bytes[at + high] << 8 | bytes[at + 1 - high]);
    };
    std::size_t at = 0;
    while (bytes.size() - at >= 2) {
        const std::uint32_t unit = unitAt(at);
        at += 2;
        if (isFirstSurrogate(unit) && bytes.size() - at >= 2 && isSecondSurrogate(unitAt(at))) {
            take(0x10000 + ((unit - 0xD800) << 10) + (unitAt(at) - 0xDC00));
            at += 2;
        } else {
            take(isFirstSurrogate(unit) || isSecondSurrogate(unit) ? kReplacement : unit);
        }
    }
    if (at != bytes.size())
        take(kReplacement);
}

} // namespace

std::string utf8FromUtf16(ByteView bytes, std::endian order)
{
    std::size_t length = 0;
    eachCharacter(bytes, order,
                  [&length](std::uint32_t character) { length += utf8Length(character); });
    std::string text;
    text.reserve(length);
    eachCharacter(bytes, order, [&text](std::uint32_t character) { appendUtf8(text, character); });
    return text;
}

std::string quotedExcerpt(std::string_view text)
{
    std::size_t length = text.size();
    if (length > kExcerptBytes) {
        length = kExcerptBytes;
        while (length > 0 && isUtf8Continuation(text[length]))
            --length;
    }
    std::string quoted = "\"";
    for (const char character : text.substr(0, length))
        quoted += static_cast<unsigned char>(character) < 0x20 ? ' ' : character;
    return quoted + (length < text.size() ? "...\"" : "\"");
}

} // namespace orvane
