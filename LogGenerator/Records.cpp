#include "LogGenerator/Records.h"

#include "LogGenerator/ArrayOutOfBoundsException.h"

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
    const std::size_t wholeBytes = bytesRead(fields);
    std::vector<PropertyValue> rows;
    for (std::size_t i = 0; i < records.count(); ++i) {
        const PacketView record = records.at(i);
        if (!record.holds(0, wholeBytes))
            break;
        PropertyValue dictionary = PropertyValue::newDictionary();
        writeRows(dictionary.asDictionary(), record, fields);
        rows.push_back(std::move(dictionary));
    }
    return rows;
}

} // namespace orvane
