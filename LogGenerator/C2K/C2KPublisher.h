#pragma once

#include "LogGenerator/Field.h"
#include "platform/base/PropertyValue.h"

#include <span>
#include <string_view>

namespace orvane
{

// Keys of the entries of a lookup: the row's key and the display dictionary that holds it.
inline constexpr const char* kLookupRowKey = "key";
inline constexpr const char* kLookupDictKey = "dict";

// Writes decoded values into the rows that the template shows them in. A lookup leads from a state
// key to an array of entries, each a row key and the display dictionary with that row.
class C2KPublisher
{
public:
    // An absent lookup publishes nothing.
    explicit C2KPublisher(PropertyValue lookup) : _lookup(std::move(lookup)) {}

    // Stores the value in every row of the state key, and stops at the first entry that is not as
    // it should be.
    void publish(std::string_view stateKey, const PropertyValue& value) const;
    // The same for a reading of the message; the description's row is the state key.
    void publishReading(const RowDescription& description, std::int64_t raw) const;
    // Publishes each field of the packet that is there; the fields' rows are state keys.
    void publish(PacketView packet, std::span<const Field> fields) const;
    // Publishes one text under the state keys of all fields.
    void publishText(const char* text, std::span<const Field> fields) const;

private:
    PropertyValue _lookup;
};

} // namespace orvane
