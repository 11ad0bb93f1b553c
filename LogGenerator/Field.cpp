#include "LogGenerator/Field.h"

#include "LogGenerator/MessageTime.h"
#include "platform/base/PropertyValue.h"

#include <utility>

namespace orvane
{

namespace
{

std::int64_t bigEndian(std::uint64_t value, unsigned bits)
{
    std::int64_t swapped = 0;
    for (unsigned shift = 0; shift < bits; shift += 8)
        swapped = swapped << 8 | static_cast<std::int64_t>(value >> shift & 0xFF);
    return swapped;
}

} // namespace

std::int64_t Field::decoded(std::uint32_t raw) const
{
    if (coding == Coding::BigEndian)
        return bigEndian(raw, bits);
    const auto value = static_cast<std::int64_t>(raw);
    const bool isNegative = coding == Coding::Signed && (value >> (bits - 1) & 1) != 0;
    return isNegative ? value - (std::int64_t{1} << bits) : value;
}

void writeRows(PropertyDictionary* rows, PacketView packet, std::span<const Field> fields)
{
    if (!rows)
        return;
    rows->reserve(fields.size());
    const std::int64_t time = MessageTime::current();
    for (const Field& field : fields)
        if (const auto raw = field.rowIn(packet))
            rows->setReading({&field, *raw, time});
}

Reading readingOf(const RowDescription& description, std::int64_t raw)
{
    return {&description, raw, MessageTime::current()};
}

void setReading(PropertyDictionary* rows, const RowDescription& description, std::int64_t raw)
{
    if (rows)
        rows->setReading(readingOf(description, raw));
}

void setRow(PropertyDictionary* rows, const char* row, std::string text)
{
    if (rows)
        rows->setText(row, std::move(text));
}

void setListRow(PropertyDictionary* rows, const char* row, std::vector<PropertyValue> elements)
{
    if (!rows)
        return;
    PropertyValue list = PropertyValue::newArray();
    list.asArray()->replaceElements(std::move(elements));
    rows->set(row, std::move(list));
}

} // namespace orvane
