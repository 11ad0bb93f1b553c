#pragma once

#include "platform/base/PropertyValue.h"

#include <string_view>

namespace orvane
{

class Resources;

// The resource as a property-list dictionary; absent when it is missing, unreadable or no
// dictionary (why it cannot be read is logged).
PropertyValue loadDictionaryResource(const Resources& resources, std::string_view name);

} // namespace orvane
