#include "ui/tree/DisplayWalk.h"

namespace orvane
{

const std::string& displayText(const PropertyValue& row)
{
    static const std::string kUnknown = "(unknown)";
    const std::string* text = row.asString();
    return text ? *text : kUnknown;
}

std::string_view nameOfSortedKey(std::string_view key)
{
    const std::size_t separator = key.find(';');
    if (separator == std::string_view::npos || key.find(';', separator + 1) != key.npos)
        return key;
    return key.substr(separator + 1);
}

} // namespace orvane
