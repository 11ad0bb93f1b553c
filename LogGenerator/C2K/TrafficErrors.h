#pragma once

#include "platform/base/PropertyValue.h"

#include <optional>

namespace orvane
{

// The moving average of frame errors that the state holds under kTrafficErrorsKey, 0 to 1, or
// nothing where that is no number. In single precision.
std::optional<float> trafficErrors(const PropertyDictionary& state);

// The rate in percent, rounded to single precision.
double percentOf(float rate);

} // namespace orvane
