#pragma once

#include "platform/base/PropertyValue.h"

#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// A group of rows of a display that tell which cell serves the phone.
struct ServingCellGroup {
    const char* group;
    std::span<const char* const> rows;
};

// Detects changes of the serving cell that a display shows. A row that shows nothing (any more)
// changes nothing.
class ServingCell
{
public:
    // For displays of the generator of that technology constant. There are never changes for
    // technologies whose displays have no such rows.
    explicit ServingCell(std::string_view technology);

    // Whether the display shows a cell other than the one noted last. The first cell counts as a
    // change.
    bool note(const PropertyValue& display);

private:
    std::span<const ServingCellGroup> _groups;
    std::vector<PropertyValue> _known; // what each row showed last
};

} // namespace orvane
