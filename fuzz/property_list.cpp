// Both formats of property lists. A list that can be read stays the same when it is written and
// read again.

#include "platform/base/PropertyValue.h"
#include "platform/base/Utf8.h"
#include "platform/plist/PropertyList.h"

#include <cmath>
#include <cstdlib>

namespace
{

using orvane::PropertyValue;

void require(bool holds)
{
    if (!holds)
        std::abort();
}

bool isXmlText(std::string_view text)
{
    for (const char character : text)
        if (static_cast<unsigned char>(character) < 0x20 && character != '\t' &&
            character != '\n' && character != '\r')
            return false;
    return text.find("\xEF\xBF\xBE") == std::string_view::npos &&
           text.find("\xEF\xBF\xBF") == std::string_view::npos;
}

// Drops the fractions of dates and the signs of not-a-numbers, which XML does not have. Returns
// whether XML can hold the rest.
bool makeWritable(PropertyValue& value)
{
    bool isWritable = true;
    if (const orvane::PropertyDictionary* const dictionary = value.asDictionary()) {
        const PropertyValue changed = PropertyValue::newDictionary();
        for (const auto& [key, entry] : *dictionary) {
            require(orvane::isValidUtf8(key));
            PropertyValue copy = entry;
            isWritable = makeWritable(copy) && isXmlText(key) && isWritable;
            changed.asDictionary()->set(key, copy);
        }
        value = changed;
    } else if (const orvane::PropertyArray* const array = value.asArray()) {
        std::vector<PropertyValue> elements = array->elements();
        for (PropertyValue& element : elements)
            isWritable = makeWritable(element) && isWritable;
        value = PropertyValue::newArray();
        value.asArray()->replaceElements(std::move(elements));
    } else if (const std::string* const text = value.asString()) {
        require(orvane::isValidUtf8(*text));
        isWritable = isXmlText(*text);
    } else if (const auto date = value.asDate()) {
        const double second = std::floor(date->secondsSince1970);
        isWritable = second >= -62135596800.0 && second <= 253402300799.0; // the years 1 to 9999
        value = PropertyValue::date({second});
    } else if (const auto number = value.asReal()) {
        value = PropertyValue::real(std::isnan(*number) ? std::nan("") : *number);
    } else {
        require(!value.isAbsent());
    }
    return isWritable;
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size)
{
    const orvane::PropertyListResult result = orvane::readPropertyList({data, size});
    require(result.value.isAbsent() != result.error.empty());
    if (!result.value) {
        require(result.error.find(" at ") != std::string::npos);
        return 0;
    }
    const PropertyValue copy = result.value.deepCopy();
    require(copy == result.value);
    require(copy.description() == result.value.description());

    PropertyValue expected = copy;
    const bool isWritable = makeWritable(expected);
    const auto text = orvane::writeXmlPropertyList(result.value);
    require(text.has_value() == isWritable);
    if (!text)
        return 0;
    const orvane::PropertyListResult again = orvane::readPropertyList(
        {reinterpret_cast<const std::uint8_t*>(text->data()), text->size()});
    require(again.value == expected);
    require(again.value.description() == expected.description());
    return 0;
}
