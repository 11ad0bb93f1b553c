#pragma once

#include "platform/base/Bytes.h"
#include "platform/base/OrderedMap.h"
#include "platform/base/Reading.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

namespace orvane
{

class PropertyArray;
class PropertyDictionary;

// A point in time as property lists carry it: seconds since 1970-01-01 00:00:00 UTC.
struct PropertyDate {
    double secondsSince1970 = 0;
    friend bool operator==(const PropertyDate&, const PropertyDate&) = default;
};

// A number that no 64-bit integer and no finite real holds, as it was written.
struct PropertyLargeNumber {
    std::string digits; // "18446744073709551616", "0x10000000000000000", "-1e400"
    bool isReal = false;
    friend bool operator==(const PropertyLargeNumber&, const PropertyLargeNumber&) = default;
};

// The one value type of commands, replies, templates, state, display and files.
//
// Scalars are values; the bytes of data are never changed, so copies share them. Dictionaries and
// arrays have reference semantics: copying a PropertyValue shares them, so that a section can keep
// writing into a subtree that the state owns; deepCopy() makes an independent tree. A default-made
// value is absent: asking it for anything yields nothing. Texts are UTF-8.
//
// A reading is a text that is made when it is asked for: text(), description(), a file and == give
// and compare its text, and its type is called "string".
class PropertyValue
{
public:
    enum class Type {
        Absent,
        Dictionary,
        Array,
        String,
        Integer,
        Real,
        Boolean,
        Data,
        Date,
        LargeNumber,
        Reading,
        TextReading
    };

    PropertyValue() = default;
    PropertyValue(std::string text) : _value(std::move(text)) {}
    PropertyValue(std::string_view text) : _value(std::string(text)) {}
    PropertyValue(const char* text) : _value(std::string(text)) {}
    PropertyValue(std::shared_ptr<PropertyDictionary> dictionary);
    PropertyValue(std::shared_ptr<PropertyArray> array);

    // Scalars are made by name, so that no number or boolean becomes another by conversion.
    static PropertyValue integer(std::int64_t number) { return PropertyValue(Storage(number)); }
    static PropertyValue real(double number) { return PropertyValue(Storage(number)); }
    static PropertyValue boolean(bool flag) { return PropertyValue(Storage(flag)); }
    static PropertyValue data(Bytes bytes);
    static PropertyValue date(PropertyDate date) { return PropertyValue(Storage(date)); }
    static PropertyValue largeNumber(PropertyLargeNumber number);
    // The description must outlive the value and its copies.
    static PropertyValue reading(const Reading& reading) { return PropertyValue(Storage(reading)); }
    static PropertyValue textReading(TextReading reading);
    static PropertyValue newDictionary();
    static PropertyValue newArray();

    // A new dictionary or array of the given content, in the given order.
    static PropertyValue
    dictionaryOf(std::initializer_list<std::pair<std::string_view, PropertyValue>> entries);
    static PropertyValue arrayOf(std::initializer_list<PropertyValue> elements);

    [[nodiscard]] Type type() const { return static_cast<Type>(_value.index()); }
    [[nodiscard]] bool isAbsent() const { return _value.index() == 0; }
    explicit operator bool() const { return !isAbsent(); }

    // Each yields nothing for a value of another type.
    [[nodiscard]] const std::string* asString() const { return std::get_if<std::string>(&_value); }
    [[nodiscard]] std::string* asString() { return std::get_if<std::string>(&_value); }
    [[nodiscard]] const Reading* asReading() const { return std::get_if<Reading>(&_value); }
    [[nodiscard]] Reading* asReading() { return std::get_if<Reading>(&_value); }
    [[nodiscard]] const TextReading* asTextReading() const;
    [[nodiscard]] std::optional<std::int64_t> asInteger() const { return scalar<std::int64_t>(); }
    [[nodiscard]] std::optional<double> asReal() const { return scalar<double>(); }
    [[nodiscard]] std::optional<bool> asBoolean() const { return scalar<bool>(); }
    [[nodiscard]] const Bytes* asData() const;
    [[nodiscard]] std::optional<PropertyDate> asDate() const { return scalar<PropertyDate>(); }
    // Converts to no integer and no real.
    [[nodiscard]] const PropertyLargeNumber* asLargeNumber() const;
    // The text of a string or a reading; nullopt for any other type.
    [[nodiscard]] std::optional<std::string> text() const;
    [[nodiscard]] bool isText() const
    {
        return asString() || asReading() || asTextReading() != nullptr;
    }
    // The container is shared, hence changeable also through a constant value.
    [[nodiscard]] PropertyDictionary* asDictionary() const;
    [[nodiscard]] PropertyArray* asArray() const;
    [[nodiscard]] std::shared_ptr<PropertyDictionary> sharedDictionary() const;
    [[nodiscard]] std::shared_ptr<PropertyArray> sharedArray() const;

    // Whether this is a dictionary that no other value holds.
    [[nodiscard]] bool isUnsharedDictionary() const;
    // The same for an array.
    [[nodiscard]] bool isUnsharedArray() const;

    // The value under the key; absent where this is no dictionary or has no such key.
    const PropertyValue& operator[](std::string_view key) const;

    // A tree that shares no dictionary and no array with this one.
    [[nodiscard]] PropertyValue deepCopy() const;

    // Equal types and contents, dictionaries regardless of their order. A not-a-number equals
    // itself.
    friend bool operator==(const PropertyValue& left, const PropertyValue& right);

    // "dictionary", "array", "string", "number", "boolean", "data", "date" or "nothing".
    [[nodiscard]] const char* typeName() const;
    // What "%@" shows in a text: a string as it is, a dictionary as {key = value; ...}, an array as
    // (value, ...), data as <hexadecimal>, a large number as its digits. On one line.
    [[nodiscard]] std::string description() const;

private:
    using DictionaryPointer = std::shared_ptr<PropertyDictionary>;
    using ArrayPointer = std::shared_ptr<PropertyArray>;
    using DataPointer = std::shared_ptr<const Bytes>;
    // Rare, so that a pointer is better than a larger value.
    using LargeNumberPointer = std::shared_ptr<const PropertyLargeNumber>;
    using TextReadingPointer = std::shared_ptr<const TextReading>;
    // The order of the alternatives is the order of Type.
    using Storage = std::variant<std::monostate, DictionaryPointer, ArrayPointer, std::string,
                                 std::int64_t, double, bool, DataPointer, PropertyDate,
                                 LargeNumberPointer, Reading, TextReadingPointer>;

    explicit PropertyValue(Storage value) : _value(std::move(value)) {}

    // The description as part of a container's, on one line whatever a text holds.
    [[nodiscard]] std::string lineOfText() const;

    template <typename T>
    [[nodiscard]] std::optional<T> scalar() const
    {
        const T* value = std::get_if<T>(&_value);
        return value ? std::optional<T>(*value) : std::nullopt;
    }

    Storage _value;
};

// Text keys to values, in the order in which keys were first stored.
class PropertyDictionary
{
public:
    [[nodiscard]] std::size_t size() const { return _entries.size(); }
    [[nodiscard]] bool empty() const { return _entries.empty(); }
    [[nodiscard]] auto begin() const { return _entries.begin(); }
    [[nodiscard]] auto end() const { return _entries.end(); }

    [[nodiscard]] bool contains(std::string_view key) const
    {
        return _entries.find(key) != nullptr;
    }
    // Absent where there is no such key.
    [[nodiscard]] const PropertyValue& operator[](std::string_view key) const;

    // Stores the value at the key's place, a new key at the end. Storing an absent value is a
    // programming error and throws std::invalid_argument.
    void set(std::string_view key, PropertyValue value);
    // Stores the reading under its description's row. Finds a row that holds a reading of the same
    // description without comparing keys: one description is stored under its own row alone.
    void setReading(const Reading& reading)
    {
        PropertyValue& value =
            _entries.at(reading.description->row, [&](const PropertyValue& known) {
                const Reading* present = known.asReading();
                return present && present->description == reading.description;
            });
        if (Reading* present = value.asReading())
            *present = reading;
        else
            value = PropertyValue::reading(reading);
    }
    // The reading that is the entry at this place, to be overwritten by one of the same
    // description; null where the entry is none or there is no such entry.
    [[nodiscard]] Reading* readingAt(std::size_t place)
    {
        return place < size() ? _entries.valueAt(place).asReading() : nullptr;
    }
    // Like set() for a text, which goes where the key's text is if it has one.
    void setText(std::string_view key, std::string&& text);
    void remove(std::string_view key) { _entries.remove(key); }
    void clear() { _entries.clear(); }
    // Makes room for that many entries at once.
    void reserve(std::size_t size) { _entries.reserve(size); }

private:
    OrderedMap<PropertyValue> _entries;
};

class PropertyArray
{
public:
    [[nodiscard]] std::size_t size() const { return _elements.size(); }
    [[nodiscard]] bool empty() const { return _elements.empty(); }
    [[nodiscard]] auto begin() const { return _elements.begin(); }
    [[nodiscard]] auto end() const { return _elements.end(); }

    // Absent where the index is not below size().
    [[nodiscard]] const PropertyValue& operator[](std::size_t index) const;
    [[nodiscard]] const std::vector<PropertyValue>& elements() const { return _elements; }

    // Makes room for that many elements at once.
    void reserve(std::size_t size) { _elements.reserve(size); }
    // Like PropertyDictionary::set, refuses an absent value.
    void append(PropertyValue value);
    // Removes `count` elements from the front, or all if there are fewer.
    void removeFirst(std::size_t count);
    // Returns what was there.
    std::vector<PropertyValue> replaceElements(std::vector<PropertyValue> elements)
    {
        return std::exchange(_elements, std::move(elements));
    }
    void clear() { _elements.clear(); }

private:
    std::vector<PropertyValue> _elements;
};

} // namespace orvane
