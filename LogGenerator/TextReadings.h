#pragma once

#include "platform/base/PropertyValue.h"

#include <optional>
#include <string_view>

namespace orvane
{

// The number in a text that is exactly one decimal number, followed by nothing or by a unit that
// the formats of readings use: "12", "-97.50 dBm", "3.21%". nullopt for any other text.
std::optional<TextReading> textReading(std::string_view text);

// A copy of the tree in which such texts are readings. For displays that come as nothing but texts:
// those of the cell monitor and of snapshots.
PropertyValue withTextReadings(const PropertyValue& tree);

} // namespace orvane
