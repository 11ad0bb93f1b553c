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

} // namespace orvane
