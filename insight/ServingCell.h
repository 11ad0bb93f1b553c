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

// Tells when the serving cell that a display shows becomes another one. A row that shows nothing
// (any more) leaves the cell what it was.
class ServingCell
{
public:
    // For displays of the generator of that technology constant; never another one for technologies
    // whose displays have no such rows.
    explicit ServingCell(std::string_view technology);

    // Whether the display shows another cell than all that were noted before; the first cell is
    // another one, too.
    bool note(const PropertyValue& display);

private:
    std::span<const ServingCellGroup> _groups;
    std::vector<PropertyValue> _known; // what each row showed last
};

} // namespace orvane
