#pragma once

#include "platform/base/PropertyValue.h"
#include "telephonyd/phone/LogSource.h"

namespace orvane
{

// What a start command asks for. Entries that are not 16-bit codes are left out, with one log line
// for each list.
LogSelection selectionOfStartCommand(const PropertyValue& command);

} // namespace orvane
