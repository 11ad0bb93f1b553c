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
        // Deliberate: the entries after a bad one are not written.
        if (!dictionary || !row)
            return;
        dictionary->set(*row, value);
    }
}

void C2KPublisher::publish(PacketView packet, std::span<const Field> fields) const
{
    for (const Field& field : fields)
        if (const auto raw = field.rowIn(packet))
            publishReading(field, *raw);
}

void C2KPublisher::publishReading(const RowDescription& description, std::int64_t raw) const
{
    publish(description.row, PropertyValue::reading(readingOf(description, raw)));
}

void C2KPublisher::publishText(const char* text, std::span<const Field> fields) const
{
    for (const Field& field : fields)
        publish(field.row, text);
}

} // namespace orvane
