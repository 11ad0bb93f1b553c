#include "LogGenerator/SharingCopier.h"

namespace orvane
{

PropertyValue SharingCopier::copy(const PropertyValue& value)
{
    _bytes += sizeof value;
    if (const std::string* text = value.asString())
        _bytes += text->size();
    if (const TextReading* reading = value.asTextReading())
        _bytes += sizeof *reading + reading->text.size();
    if (const Bytes* data = value.asData())
        _bytes += data->size();

    const PropertyDictionary* dictionary = value.asDictionary();
    const PropertyArray* array = value.asArray();
    if (!dictionary && !array)
        return value;
    const void* original = dictionary ? static_cast<const void*>(dictionary) : array;
    if (const auto known = _copies.find(original); known != _copies.end())
        return known->second;

    const PropertyValue copied =
        dictionary ? PropertyValue::newDictionary() : PropertyValue::newArray();
    _copies.emplace(original, copied);
    if (dictionary) {
        _bytes += sizeof *dictionary;
        copied.asDictionary()->reserve(dictionary->size());
        for (const auto& [key, entry] : *dictionary) {
            _bytes += sizeof key + key.size();
            copied.asDictionary()->set(key, copy(entry));
        }
    } else {
        _bytes += sizeof *array;
        for (const PropertyValue& element : *array)
            copied.asArray()->append(copy(element));
    }
    return copied;
}

} // namespace orvane
