#pragma once

#include "platform/base/PropertyValue.h"

#include <cstddef>
#include <unordered_map>

namespace orvane
{

// Copies trees of values so that what several of them share, or one holds twice, is shared by the
// copies in the same way. The originals must stay as they are for as long as it is used.
class SharingCopier
{
public:
    PropertyValue copy(const PropertyValue& value);
    // About how much memory the copies take.
    [[nodiscard]] std::size_t bytes() const { return _bytes; }

private:
    std::unordered_map<const void*, PropertyValue> _copies;
    std::size_t _bytes = 0;
};

} // namespace orvane
