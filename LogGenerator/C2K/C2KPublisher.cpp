#include "LogGenerator/C2K/C2KPublisher.h"

namespace orvane
{

void C2KPublisher::publish(std::string_view stateKey, const PropertyValue& value) const
{
    const PropertyArray* entries = _lookup[stateKey].asArray();
    if (!entries)
        return;
    for (const PropertyValue& entry : *entries) {
        PropertyDictionary* dictionary = entry[kLookupDictKey].asDictionary();
        const std::string* row = entry[kLookupRowKey].asString();
        // The entries after a bad one are not written. This is meant.
        if (!dictionary || !row)
            return;
        dictionary->set(*row, value);
    }
}

void C2KPublisher::publish(PacketView packet, std::span<const Field> fields) const
{
    for (const Field& field : fields)
        if (const auto raw = field.valueIn(packet))
            if (const RowText text = field.format(*raw))
                publish(field.row, *text);
}

void C2KPublisher::publishText(const char* text, std::span<const Field> fields) const
{
    for (const Field& field : fields)
        publish(field.row, text);
}

} // namespace orvane
