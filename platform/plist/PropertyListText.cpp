#include "platform/plist/PropertyListText.h"

#include "platform/base/Utf8.h"

namespace orvane
{

namespace
{

constexpr std::size_t kExcerptBytes = 40;

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
        while (length > 0 && isUtf8Continuation(text[length]))
            --length;
    }
    std::string quoted = "\"";
    for (const char character : text.substr(0, length))
        quoted += static_cast<unsigned char>(character) < 0x20 ? ' ' : character;
    return quoted + (length < text.size() ? "...\"" : "\"");
}

} // namespace orvane
