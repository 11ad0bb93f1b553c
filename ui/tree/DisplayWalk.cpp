#include "ui/tree/DisplayWalk.h"

namespace orvane
{

std::string displayText(const PropertyValue& row) { return row.text().value_or("(unknown)"); }

std::string_view nameOfSortedKey(std::string_view key)
{
    const std::size_t separator = key.find(';');
    if (separator == std::string_view::npos || key.find(';', separator + 1) != key.npos)
        return key;
    return key.substr(separator + 1);
}

std::string_view shownName(std::string_view name)
{
    if (name.size() <= kLongestName)
        return name;
    std::size_t end = kLongestName;
    // Not within a character of UTF-8, which has at most three continuation bytes.
    for (int i = 0; i < 3 && (static_cast<unsigned char>(name[end]) & 0xC0) == 0x80; ++i)
        --end;
    return name.substr(0, end);
}

} // namespace orvane
