#pragma once

#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyListMemory.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace orvane
{

// Builds the value of an XML property list from its elements and texts in their order. An operation
// returns false if they are not a property list; error() then says why, and no other operation may
// follow.
class PropertyListXmlBuilder
{
public:
    // `listBytes`: the size of the list, for the memory that its values may take.
    explicit PropertyListXmlBuilder(std::size_t listBytes);

    bool startElement(std::string_view name);
    bool addText(std::string_view text);
    // If it returns false, the element that was started last is wrong.
    bool endElement();

    [[nodiscard]] const std::string& error() const { return _error; }
    // The list's value, after its last element has ended.
    [[nodiscard]] const PropertyValue& root() const { return _root; }

private:
    enum class Element {
        Unknown,
        PropertyList,
        Dictionary,
        Array,
        Key,
        String,
        Integer,
        Real,
        True,
        False,
        Data,
        Date
    };
    struct Name;
    struct OpenContainer {
        PropertyValue value;
        std::optional<std::string> key; // waits for its value; dictionaries only
        std::size_t entries = 0;
    };

    static const Name kNames[];
    static Element elementNamed(std::string_view name);

    bool fail(std::string text);
    bool canStartHere(Element element, std::string_view name);
    bool endContainer();
    PropertyValue leafValue();
    // Stores the value, a container while it is empty. False if it exceeds the memory of the list.
    bool add(PropertyValue value);
    bool spendFor(const PropertyValue& value);

    PropertyListMemory _memory;
    bool _isInside = false;       // <plist>
    std::optional<Element> _leaf; // the open element that holds a text or nothing
    std::string _text;            // of that element so far
    std::vector<OpenContainer> _open;
    PropertyValue _root;
    std::string _error;
};

} // namespace orvane
