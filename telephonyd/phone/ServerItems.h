#pragma once

#include "platform/base/PropertyValue.h"
#include "telephonyd/phone/Scenario.h"

namespace orvane
{

// The items that the telephony server makes itself: property lists under numbers.

// The value as XML in an item of that number. The value must be one that XML can carry.
PhoneMessage serverItem(std::uint16_t number, const PropertyValue& value);

constexpr std::uint16_t kSimFilesItem = 0;
constexpr std::uint16_t kCellsItem = 1;
constexpr std::uint16_t kDataConnectionsItem = 2;

// The files of a test card: mostly text, some as the card holds them.
PropertyValue simFiles();

// A data connection as the server lists it. `number` tells its addresses apart.
PropertyValue dataConnection(const char* accessPointName, const char* qosClass, unsigned number);

// The same for networks before LTE. The access point id (5 to 15) tells a phone's contexts apart.
PropertyValue packetDataContext(const char* accessPointName, const char* trafficClass,
                                unsigned accessPointId, unsigned number);

} // namespace orvane
