#include "telephonyd/phone/DataConnections.h"

#include "telephonyd/phone/ServerItems.h"

namespace orvane
{

namespace
{

// An address of the range that is reserved for examples.
std::string exampleAddress(unsigned number)
{
    return "192.0.2." + std::to_string(1 + number % 254);
}

PropertyValue lteConnection(const char* accessPointName, const char* qosClass, unsigned number)
{
    return PropertyValue::dictionaryOf({
        {"APN",        accessPointName       },
        {"IP Address", exampleAddress(number)},
        {"State",      "Active"              },
        {"QCI",        qosClass              },
    });
}

// The access point identifier (5 to 15) tells a phone's contexts apart.
PropertyValue packetDataContext(const char* accessPointName, const char* trafficClass,
                                unsigned accessPointId, unsigned number)
{
    return PropertyValue::dictionaryOf({
        {"APN",           accessPointName              },
        {"IP Address",    exampleAddress(number)       },
        {"State",         "Active"                     },
        {"NSAPI",         std::to_string(accessPointId)},
        {"Traffic Class", trafficClass                 },
    });
}

} // namespace

bool DataConnections::advance(std::chrono::milliseconds now)
{
    if (!_rest.advance(now))
        return false;
    _count += _rest.isOn() ? 1 : 0;
    return true;
}

PhoneMessage DataConnections::item() const
{
    const bool isLte = _network == Network::LTE;
    PropertyValue list = PropertyValue::arrayOf(
        {isLte ? lteConnection("ims", "5", 0) : packetDataContext("mms", "Background", 5, 0)});
    if (_rest.isOn())
        list.asArray()->append(isLte ? lteConnection("internet", "9", _count)
                                     : packetDataContext("internet", "Interactive", 6, _count));
    return serverItem(kDataConnectionsItem, list);
}

} // namespace orvane
