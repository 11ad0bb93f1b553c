#include "LogGenerator/Records.h"

#include "LogGenerator/ArrayOutOfBoundsException.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

PacketView Records::at(std::size_t index) const
{
    if (index >= _count)
        throw ArrayOutOfBoundsException();
    return _packet.from(_first + index * _stride);
}

std::vector<PropertyValue> recordRows(const Records& records, std::span<const Field> fields)
{
    std::vector<PropertyValue> rows;
    forEachWholeRecord(records, bytesRead(fields), [&](PacketView record) {
        rows.push_back(PropertyValue::newDictionary());
        writeRows(rows.back().asDictionary(), record, fields);
    });
    return rows;
}

} // namespace orvane
