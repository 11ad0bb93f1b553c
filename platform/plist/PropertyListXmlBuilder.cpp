#include "platform/plist/PropertyListXmlBuilder.h"

#include "platform/plist/PropertyList.h"
#include "platform/plist/PropertyListText.h"
#include "platform/plist/PropertyListXmlScalars.h"

#include <algorithm>

namespace orvane
{

struct PropertyListXmlBuilder::Name {
    std::string_view name;
    Element element;
};

const PropertyListXmlBuilder::Name PropertyListXmlBuilder::kNames[] = {
    {"key",     Element::Key         },
    {"string",  Element::String      },
    {"integer", Element::Integer     },
    {"dict",    Element::Dictionary  },
    {"array",   Element::Array       },
    {"true",    Element::True        },
    {"false",   Element::False       },
    {"real",    Element::Real        },
    {"data",    Element::Data        },
    {"date",    Element::Date        },
    {"plist",   Element::PropertyList},
};

namespace
{

bool isAllSpace(std::string_view text) { return std::all_of(text.begin(), text.end(), isXmlSpace); }

} // namespace

PropertyListXmlBuilder::PropertyListXmlBuilder(std::size_t listBytes) : _memory(listBytes)
{
    _open.reserve(8);
}

PropertyListXmlBuilder::Element PropertyListXmlBuilder::elementNamed(std::string_view name)
{
    for (const Name& entry : kNames)
        if (entry.name == name)
            return entry.element;
    return Element::Unknown;
}

bool PropertyListXmlBuilder::startElement(std::string_view name)
{
    const Element element = elementNamed(name);
    if (!canStartHere(element, name))
        return false;
    switch (element) {
    case Element::PropertyList:
        _isInside = true;
        break;
    case Element::Dictionary:
    case Element::Array: {
        PropertyValue container = element == Element::Dictionary ? PropertyValue::newDictionary()
                                                                 : PropertyValue::newArray();
        if (!add(container))
            return false;
        _open.push_back({std::move(container), std::nullopt});
        break;
    }
    default:
        _leaf = element;
        _text.clear();
        break;
    }
    return true;
}

bool PropertyListXmlBuilder::canStartHere(Element element, std::string_view name)
{
    if (!_isInside) {
        if (element != Element::PropertyList)
            return fail("the root element is " + quotedExcerpt(name) + " instead of \"plist\"");
        return true;
    }
    if (_leaf)
        return fail("element " + quotedExcerpt(name) + " inside a value that has no elements");
    if (element == Element::Unknown || element == Element::PropertyList)
        return fail("unexpected element " + quotedExcerpt(name));

    const OpenContainer* const container = _open.empty() ? nullptr : &_open.back();
    const bool isInDictionary = container && container->value.asDictionary();
    if (element == Element::Key) {
        if (!isInDictionary)
            return fail("a key outside a dictionary");
        if (container->key)
            return fail("key " + quotedExcerpt(*container->key) + " without a value");
        return true;
    }
    if (isInDictionary && !container->key)
        return fail("a value without a key");
    if (!container && _root)
        return fail("more than one root value");
    if ((element == Element::Dictionary || element == Element::Array) &&
        _open.size() == kPropertyListDepthLimit)
        return fail("nested deeper than " + std::to_string(kPropertyListDepthLimit) + " levels");
    return true;
}

bool PropertyListXmlBuilder::addText(std::string_view text)
{
    const bool holdsText = _leaf && *_leaf != Element::True && *_leaf != Element::False;
    if (holdsText)
        _text += text;
    else if (!isAllSpace(text))
        return fail("text " + quotedExcerpt(text) + " outside a value");
    return true;
}

bool PropertyListXmlBuilder::endElement()
{
    if (!_leaf)
        return endContainer();
    if (*_leaf == Element::Key) {
        _open.back().key = std::move(_text);
    } else {
        PropertyValue value = leafValue();
        if (!value || !add(std::move(value)))
            return false;
    }
    _leaf.reset();
    return true;
}

bool PropertyListXmlBuilder::endContainer()
{
    if (_open.empty()) // the end of <plist> itself
        return _root ? true : fail("no root value");
    if (_open.back().key)
        return fail("key " + quotedExcerpt(*_open.back().key) + " without a value");
    _open.pop_back();
    return true;
}

PropertyValue PropertyListXmlBuilder::leafValue()
{
    switch (*_leaf) {
    case Element::Integer:
        return integerFromXml(_text, _error);
    case Element::Real:
        return realFromXml(_text, _error);
    case Element::Date:
        return dateFromXml(_text, _error);
    case Element::Data:
        return dataFromXml(_text, _error);
    case Element::True:
    case Element::False:
        return PropertyValue::boolean(*_leaf == Element::True);
    default:
        return PropertyValue(std::move(_text));
    }
}

bool PropertyListXmlBuilder::add(PropertyValue value)
{
    if (!spendFor(value))
        return fail("too many values for the length of the list");
    if (_open.empty()) {
        _root = std::move(value);
        return true;
    }
    OpenContainer& container = _open.back();
    if (PropertyDictionary* const dictionary = container.value.asDictionary()) {
        dictionary->set(*container.key, std::move(value));
        container.key.reset();
    } else {
        container.value.asArray()->append(std::move(value));
    }
    return true;
}

bool PropertyListXmlBuilder::spendFor(const PropertyValue& value)
{
    using Memory = PropertyListMemory;
    // A container that grows has room for up to twice its elements, beside its earlier room.
    constexpr std::size_t kGrowth = 3;
    std::size_t bytes = 0;
    if (!_open.empty()) {
        OpenContainer& container = _open.back();
        ++container.entries;
        if (container.key) {
            const std::size_t key = Memory::text(container.key->size());
            bytes += kGrowth * Memory::kEntryBytes + key;
            if (container.entries >= Memory::kIndexedEntries)
                bytes += Memory::kIndexBytes + key;
        } else {
            bytes += kGrowth * Memory::kElementBytes;
        }
    }
    if (value.asDictionary())
        bytes += Memory::dictionary();
    else if (value.asArray())
        bytes += Memory::array();
    else if (const std::string* text = value.asString())
        bytes += Memory::text(text->capacity());
    else if (const Bytes* data = value.asData())
        bytes += Memory::data(data->capacity());
    else if (const PropertyLargeNumber* number = value.asLargeNumber())
        bytes += Memory::largeNumber(number->digits.size());
    return _memory.spend(bytes);
}

bool PropertyListXmlBuilder::fail(std::string text)
{
    _error = std::move(text);
    return false;
}

} // namespace orvane
