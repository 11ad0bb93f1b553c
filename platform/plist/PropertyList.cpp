#include "platform/plist/PropertyList.h"

#include "platform/plist/PropertyListBinaryReader.h"
#include "platform/plist/PropertyListXmlReader.h"
#include "platform/plist/PropertyListXmlScalars.h"

#include <algorithm>

namespace orvane
{

namespace
{

bool startsWith(ByteView bytes, std::string_view text)
{
    return bytes.size() >= text.size() &&
           std::equal(text.begin(), text.end(), bytes.begin(),
                      [](char character, std::uint8_t byte) {
                          return static_cast<std::uint8_t>(character) == byte;
                      });
}

// Whether the bytes can be XML at all: a byte-order mark, white space or a tag comes first.
bool looksLikeXml(ByteView bytes)
{
    for (const std::string_view mark : {"\xEF\xBB\xBF", "\xFF\xFE", "\xFE\xFF"})
        if (startsWith(bytes, mark))
            return true;
    const auto isSpace = [](std::uint8_t byte) { return isXmlSpace(static_cast<char>(byte)); };
    const auto first = std::find_if_not(bytes.begin(), bytes.end(), isSpace);
    const ByteView rest = bytes.subspan(static_cast<std::size_t>(first - bytes.begin()));
    return startsWith(rest, "<") || startsWith(bytes, std::string_view("\0<", 2));
}

} // namespace

PropertyListResult readPropertyList(ByteView bytes)
{
    if (startsWith(bytes, "bplist00"))
        return readBinaryPropertyList(bytes);
    if (startsWith(bytes, "bplist"))
        return {{}, "binary property list of an unknown version at byte 6"};
    if (!looksLikeXml(bytes))
        return {{}, "neither an XML nor a binary property list at byte 0"};
    return readXmlPropertyList(bytes);
}

} // namespace orvane
