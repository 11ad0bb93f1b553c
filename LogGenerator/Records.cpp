#include "LogGenerator/Records.h"

#include "LogGenerator/ArrayOutOfBoundsException.h"
#include "LogGenerator/MessageTime.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

// As many as the counts of most packets reach.
constexpr std::size_t kMostSpare = 32;

// The entry at the place where it holds a reading of the description, else null.
Reading* readingOf(const RowDescription* description, PropertyDictionary& rows, std::size_t place)
{
    Reading* present = rows.readingAt(place);
    return present && present->description == description ? present : nullptr;
}

// Gives the rows the readings if they are exactly theirs. Otherwise the rows are of no more use.
bool overwrite(PropertyDictionary& rows, std::span<const Reading> readings)
{
    std::size_t place = 0;
    for (const Reading& reading : readings) {
        Reading* present = readingOf(reading.description, rows, place++);
        if (!present)
            return false;
        *present = reading;
    }
    return place == rows.size();
}

bool overwrite(PropertyDictionary& rows, PacketView record, std::span<const Field> fields,
               std::span<const Field> others)
{
    const std::int64_t time = MessageTime::current();
    std::size_t place = 0;
    for (const std::span<const Field> table : {fields, others})
        for (const Field& field : table) {
            const auto raw = field.rowIn(record);
            if (!raw)
                continue;
            Reading* present = readingOf(&field, rows, place++);
            if (!present)
                return false;
            present->raw = *raw;
            present->time = time;
        }
    return place == rows.size();
}

} // namespace

PacketView Records::at(std::size_t index) const
{
    if (index >= _count)
        throw ArrayOutOfBoundsException();
    return _packet.from(_first + index * _stride);
}

void ListElements::begin(std::vector<PropertyValue> earlier)
{
    _elements = std::move(earlier);
    _count = 0;
}

PropertyDictionary* ListElements::reusable()
{
    if (_count == _elements.size() && !_spare.empty()) {
        _elements.push_back(std::move(_spare.back()));
        _spare.pop_back();
    }
    return _count < _elements.size() && _elements[_count].isUnsharedDictionary()
               ? _elements[_count].asDictionary()
               : nullptr;
}

void ListElements::add(std::span<const Reading> readings)
{
    if (PropertyDictionary* rows = reusable(); rows && overwrite(*rows, readings)) {
        ++_count;
        return;
    }
    PropertyValue element = PropertyValue::newDictionary();
    element.asDictionary()->reserve(readings.size());
    for (const Reading& reading : readings)
        element.asDictionary()->setReading(reading);
    add(std::move(element));
}

void ListElements::add(PacketView record, std::span<const Field> fields,
                       std::span<const Field> others)
{
    PropertyDictionary* rows = reusable();
    if (rows && overwrite(*rows, record, fields, others)) {
        ++_count;
        return;
    }
    PropertyValue element = PropertyValue::newDictionary();
    element.asDictionary()->reserve(fields.size() + others.size());
    writeRows(element.asDictionary(), record, fields);
    writeRows(element.asDictionary(), record, others);
    add(std::move(element));
}

PropertyDictionary& ListElements::addRows(const RowDescription& first, std::size_t entries)
{
    PropertyDictionary* rows = reusable();
    if (rows && rows->size() == entries && readingOf(&first, *rows, 0)) {
        ++_count;
        return *rows;
    }
    PropertyValue element = PropertyValue::newDictionary();
    PropertyDictionary& added = *element.asDictionary();
    added.reserve(entries);
    add(std::move(element));
    return added;
}

void ListElements::add(PropertyValue element)
{
    if (_count < _elements.size())
        _elements[_count] = std::move(element);
    else
        _elements.push_back(std::move(element));
    ++_count;
}

void ListElements::addAll(const Records& records, std::span<const Field> fields)
{
    forEachWholeRecord(records, bytesRead(fields), [&](PacketView record) { add(record, fields); });
}

std::vector<PropertyValue> ListElements::take()
{
    for (; _elements.size() > _count; _elements.pop_back())
        if (_spare.size() < kMostSpare)
            _spare.push_back(std::move(_elements.back()));
    _count = 0;
    return std::exchange(_elements, {});
}

std::vector<PropertyValue> recordRows(const Records& records, std::span<const Field> fields)
{
    ListElements elements;
    elements.addAll(records, fields);
    return elements.take();
}

} // namespace orvane
