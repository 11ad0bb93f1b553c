#include "platform/base/PropertyValue.h"

#include "platform/base/Calendar.h"
#include "platform/base/Utf8.h"

#include <cmath>
#include <cstdio>
#include <initializer_list>
#include <stdexcept>

namespace orvane
{

namespace
{

const PropertyValue kAbsent;

std::string formattedReal(double number)
{
    char text[64];
    std::snprintf(text, sizeof text, "%.17g", number);
    return text;
}

std::string hexadecimal(const Bytes& bytes)
{
    static constexpr char kDigits[] = "0123456789abcdef";
    std::string text = "<";
    for (const std::uint8_t byte : bytes) {
        text += kDigits[byte >> 4];
        text += kDigits[byte & 15];
    }
    return text + ">";
}

bool equalDictionaries(const PropertyDictionary& left, const PropertyDictionary& right)
{
    if (left.size() != right.size())
        return false;
    for (const auto& [key, value] : left)
        if (!right.contains(key) || !(right[key] == value))
            return false;
    return true;
}

bool equalReals(double left, double right)
{
    return left == right || (std::isnan(left) && std::isnan(right));
}

} // namespace

PropertyValue::PropertyValue(std::shared_ptr<PropertyDictionary> dictionary)
{
    if (dictionary)
        _value = std::move(dictionary);
}

PropertyValue::PropertyValue(std::shared_ptr<PropertyArray> array)
{
    if (array)
        _value = std::move(array);
}

PropertyValue PropertyValue::data(Bytes bytes)
{
    return PropertyValue(Storage(std::make_shared<const Bytes>(std::move(bytes))));
}

PropertyValue PropertyValue::largeNumber(PropertyLargeNumber number)
{
    return PropertyValue(Storage(std::make_shared<const PropertyLargeNumber>(std::move(number))));
}

PropertyValue PropertyValue::textReading(TextReading reading)
{
    return PropertyValue(Storage(std::make_shared<const TextReading>(std::move(reading))));
}

PropertyValue PropertyValue::newDictionary() { return std::make_shared<PropertyDictionary>(); }

PropertyValue PropertyValue::newArray() { return std::make_shared<PropertyArray>(); }

PropertyValue PropertyValue::dictionaryOf(
    std::initializer_list<std::pair<std::string_view, PropertyValue>> entries)
{
    auto dictionary = std::make_shared<PropertyDictionary>();
    for (const auto& [key, value] : entries)
        dictionary->set(key, value);
    return dictionary;
}

PropertyValue PropertyValue::arrayOf(std::initializer_list<PropertyValue> elements)
{
    auto array = std::make_shared<PropertyArray>();
    for (const PropertyValue& element : elements)
        array->append(element);
    return array;
}

const Bytes* PropertyValue::asData() const
{
    const DataPointer* pointer = std::get_if<DataPointer>(&_value);
    return pointer ? pointer->get() : nullptr;
}

const PropertyLargeNumber* PropertyValue::asLargeNumber() const
{
    const LargeNumberPointer* pointer = std::get_if<LargeNumberPointer>(&_value);
    return pointer ? pointer->get() : nullptr;
}

const TextReading* PropertyValue::asTextReading() const
{
    const TextReadingPointer* pointer = std::get_if<TextReadingPointer>(&_value);
    return pointer ? pointer->get() : nullptr;
}

std::optional<std::string> PropertyValue::text() const
{
    if (const std::string* string = asString())
        return *string;
    if (const Reading* reading = asReading())
        return reading->text();
    if (const TextReading* reading = asTextReading())
        return reading->text;
    return std::nullopt;
}

PropertyDictionary* PropertyValue::asDictionary() const
{
    const DictionaryPointer* pointer = std::get_if<DictionaryPointer>(&_value);
    return pointer ? pointer->get() : nullptr;
}

PropertyArray* PropertyValue::asArray() const
{
    const ArrayPointer* pointer = std::get_if<ArrayPointer>(&_value);
    return pointer ? pointer->get() : nullptr;
}

std::shared_ptr<PropertyDictionary> PropertyValue::sharedDictionary() const
{
    const DictionaryPointer* pointer = std::get_if<DictionaryPointer>(&_value);
    return pointer ? *pointer : nullptr;
}

std::shared_ptr<PropertyArray> PropertyValue::sharedArray() const
{
    const ArrayPointer* pointer = std::get_if<ArrayPointer>(&_value);
    return pointer ? *pointer : nullptr;
}

const PropertyValue& PropertyValue::operator[](std::string_view key) const
{
    const PropertyDictionary* dictionary = asDictionary();
    return dictionary ? (*dictionary)[key] : kAbsent;
}

PropertyValue PropertyValue::deepCopy() const
{
    if (const PropertyDictionary* dictionary = asDictionary()) {
        auto copy = std::make_shared<PropertyDictionary>();
        for (const auto& [key, value] : *dictionary)
            copy->set(key, value.deepCopy());
        return copy;
    }
    if (const PropertyArray* array = asArray()) {
        auto copy = std::make_shared<PropertyArray>();
        for (const PropertyValue& element : *array)
            copy->append(element.deepCopy());
        return copy;
    }
    return *this;
}

bool PropertyValue::isUnsharedDictionary() const
{
    const DictionaryPointer* pointer = std::get_if<DictionaryPointer>(&_value);
    return pointer && pointer->use_count() == 1;
}

bool PropertyValue::isUnsharedArray() const
{
    const ArrayPointer* pointer = std::get_if<ArrayPointer>(&_value);
    return pointer && pointer->use_count() == 1;
}

bool operator==(const PropertyValue& left, const PropertyValue& right)
{
    const Reading* leftReading = left.asReading();
    const Reading* rightReading = right.asReading();
    if (leftReading && rightReading && leftReading->description == rightReading->description &&
        leftReading->raw == rightReading->raw)
        return true;
    if (leftReading || rightReading || left.asTextReading() || right.asTextReading())
        return left.isText() && right.isText() && left.text() == right.text();
    if (left.type() != right.type())
        return false;
    switch (left.type()) {
    case PropertyValue::Type::Dictionary:
        return left.asDictionary() == right.asDictionary() ||
               equalDictionaries(*left.asDictionary(), *right.asDictionary());
    case PropertyValue::Type::Array:
        return left.asArray()->elements() == right.asArray()->elements();
    case PropertyValue::Type::Data:
        return *left.asData() == *right.asData();
    case PropertyValue::Type::LargeNumber:
        return *left.asLargeNumber() == *right.asLargeNumber();
    case PropertyValue::Type::Real:
        return equalReals(*left.asReal(), *right.asReal());
    case PropertyValue::Type::Date:
        return equalReals(left.asDate()->secondsSince1970, right.asDate()->secondsSince1970);
    default:
        return left._value == right._value;
    }
}

const char* PropertyValue::typeName() const
{
    switch (type()) {
    case Type::Dictionary:
        return "dictionary";
    case Type::Array:
        return "array";
    case Type::String:
    case Type::Reading:
    case Type::TextReading:
        return "string";
    case Type::Integer:
    case Type::Real:
    case Type::LargeNumber:
        return "number";
    case Type::Boolean:
        return "boolean";
    case Type::Data:
        return "data";
    case Type::Date:
        return "date";
    case Type::Absent:
        break;
    }
    return "nothing";
}

std::string PropertyValue::description() const
{
    switch (type()) {
    case Type::Dictionary: {
        std::string text = "{";
        const char* separator = "";
        for (const auto& [key, value] : *asDictionary()) {
            text += separator + shownText(key) + " = " + value.lineOfText();
            separator = "; ";
        }
        return text + "}";
    }
    case Type::Array: {
        std::string text = "(";
        const char* separator = "";
        for (const PropertyValue& element : *asArray()) {
            text += separator + element.lineOfText();
            separator = ", ";
        }
        return text + ")";
    }
    case Type::String:
    case Type::Reading:
    case Type::TextReading:
        return *text();
    case Type::Integer:
        return std::to_string(*asInteger());
    case Type::Real:
        return formattedReal(*asReal());
    case Type::LargeNumber:
        return asLargeNumber()->digits;
    case Type::Boolean:
        return *asBoolean() ? "true" : "false";
    case Type::Data:
        return hexadecimal(*asData());
    case Type::Date:
        return absoluteDateText(asDate()->secondsSince1970);
    case Type::Absent:
        break;
    }
    return "(null)";
}

std::string PropertyValue::lineOfText() const
{
    return isText() ? shownText(*text()) : description();
}

const PropertyValue& PropertyDictionary::operator[](std::string_view key) const
{
    const PropertyValue* value = _entries.find(key);
    return value ? *value : kAbsent;
}

void PropertyDictionary::set(std::string_view key, PropertyValue value)
{
    if (value.isAbsent())
        throw std::invalid_argument("an absent value cannot be stored under \"" + std::string(key) +
                                    "\"");
    _entries[key] = std::move(value);
}

void PropertyDictionary::setText(std::string_view key, std::string&& text)
{
    PropertyValue& value = _entries[key];
    if (std::string* present = value.asString())
        *present = std::move(text);
    else
        value = PropertyValue(std::move(text));
}

const PropertyValue& PropertyArray::operator[](std::size_t index) const
{
    return index < _elements.size() ? _elements[index] : kAbsent;
}

void PropertyArray::append(PropertyValue value)
{
    if (value.isAbsent())
        throw std::invalid_argument("an absent value cannot be stored in an array");
    _elements.push_back(std::move(value));
}

void PropertyArray::removeFirst(std::size_t count)
{
    if (count > _elements.size())
        count = _elements.size();
    _elements.erase(_elements.begin(), _elements.begin() + static_cast<std::ptrdiff_t>(count));
}

} // namespace orvane
