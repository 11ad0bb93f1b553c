#include "platform/plist/PropertyListBinaryReader.h"

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"
#include "platform/plist/PropertyListBinaryObjects.h"
#include "platform/plist/PropertyListMemory.h"
#include "platform/plist/PropertyListText.h"

#include <algorithm>
#include <bit>

namespace orvane
{

namespace
{

using Object = PropertyListBinaryObjects::Object;
using Type = PropertyListBinaryObjects::Type;

// 2001-01-01 00:00:00 UTC, from which binary lists count.
constexpr double kDateOrigin = 978307200;

using Memory = PropertyListMemory;

// The integer, big-endian with its sign, in decimal.
std::string decimalDigits(Bytes integer)
{
    const bool isNegative = (integer[0] & 0x80) != 0;
    if (isNegative) {
        unsigned carry = 1;
        for (auto byte = integer.rbegin(); byte != integer.rend(); ++byte) {
            carry += 0xFFU - *byte;
            *byte = static_cast<std::uint8_t>(carry & 0xFF);
            carry >>= 8;
        }
    }
    std::string digits;
    while (std::any_of(integer.begin(), integer.end(), [](auto byte) { return byte != 0; })) {
        unsigned remainder = 0;
        for (std::uint8_t& byte : integer) {
            remainder = remainder << 8 | byte;
            byte = static_cast<std::uint8_t>(remainder / 10);
            remainder %= 10;
        }
        digits += static_cast<char>('0' + remainder);
    }
    if (isNegative)
        digits += '-';
    return {digits.rbegin(), digits.rend()};
}

// Builds values from objects. An absent value means that `_error` says why.
class TreeBuilder
{
public:
    explicit TreeBuilder(ByteView bytes) : _objects(bytes), _memory(bytes.size()) {}
    PropertyListResult read();

private:
    PropertyValue value(std::size_t index);
    PropertyValue contentOf(const Object& object);
    PropertyValue integer(const Object& object);
    PropertyValue largeInteger(const Object& object);
    PropertyValue real(const Object& object);
    PropertyValue string(const Object& object);
    PropertyValue array(const Object& object);
    PropertyValue dictionary(const Object& object);
    enum class Use { Element, Key };
    // The value of the object that the container's n-th reference names.
    PropertyValue referenced(const Object& container, std::size_t n, Use use = Use::Element);
    // Whether so much memory is within the limit; fails otherwise. Called before it is taken.
    bool spend(std::size_t bytes, const Object& on);
    PropertyValue fail(std::string what, std::size_t at);

    PropertyListBinaryObjects _objects;
    Memory _memory;
    std::vector<bool> _isOpen; // whether the object's value is being built
    std::size_t _depth = 0;
    std::string _error;
};

PropertyListResult TreeBuilder::read()
{
    if (!_objects.isRead())
        return {{}, _objects.error()};
    _isOpen.resize(_objects.count());
    PropertyValue root = value(_objects.rootIndex());
    return {std::move(root), std::move(_error)};
}

PropertyValue TreeBuilder::fail(std::string what, std::size_t at)
{
    _error = std::move(what) + " at byte " + std::to_string(at);
    return {};
}

bool TreeBuilder::spend(std::size_t bytes, const Object& on)
{
    if (!_memory.spend(bytes)) {
        fail("too many values for the length of the list, with the object", on.begin);
        return false;
    }
    return true;
}

PropertyValue TreeBuilder::value(std::size_t index)
{
    const Object object = _objects[index];
    if (_isOpen[index])
        return fail("reference cycle through the object", object.begin);
    const bool isContainer = object.type == Type::Array || object.type == Type::Dictionary;
    if (!isContainer)
        return contentOf(object);

    if (_depth == kPropertyListDepthLimit)
        return fail("nested deeper than " + std::to_string(kPropertyListDepthLimit) + " levels",
                    object.begin);
    _isOpen[index] = true;
    ++_depth;
    PropertyValue container = contentOf(object);
    --_depth;
    _isOpen[index] = false;
    return container;
}

PropertyValue TreeBuilder::contentOf(const Object& object)
{
    switch (object.type) {
    case Type::False:
    case Type::True:
        return PropertyValue::boolean(object.type == Type::True);
    case Type::Integer:
        return integer(object);
    case Type::Real:
        return real(object);
    case Type::Date: {
        const auto seconds = std::bit_cast<double>(bigEndian(_objects.content(object)));
        return PropertyValue::date({seconds + kDateOrigin});
    }
    case Type::Data: {
        if (!spend(Memory::data(object.count), object))
            return {};
        const ByteView content = _objects.content(object);
        return PropertyValue::data(Bytes(content.begin(), content.end()));
    }
    case Type::AsciiString:
    case Type::Utf16String:
        return string(object);
    case Type::Array:
        return array(object);
    case Type::Dictionary:
        return dictionary(object);
    }
    return {};
}

PropertyValue TreeBuilder::integer(const Object& object)
{
    // Integers of 1, 2 and 4 bytes have no sign, those of 8 and 16 bytes have one.
    ByteView content = _objects.content(object);
    if (content.size() == 16) {
        const ByteView high = content.first(8);
        content = content.last(8);
        const std::uint8_t sign = (content[0] & 0x80) != 0 ? 0xFF : 0;
        if (!std::all_of(high.begin(), high.end(), [sign](auto byte) { return byte == sign; }))
            return largeInteger(object);
    }
    return PropertyValue::integer(static_cast<std::int64_t>(bigEndian(content)));
}

PropertyValue TreeBuilder::largeInteger(const Object& object)
{
    const ByteView content = _objects.content(object);
    PropertyLargeNumber number{decimalDigits(Bytes(content.begin(), content.end())), false};
    if (!spend(Memory::largeNumber(number.digits.size()), object))
        return {};
    return PropertyValue::largeNumber(std::move(number));
}

PropertyValue TreeBuilder::real(const Object& object)
{
    const std::uint64_t bits = bigEndian(_objects.content(object));
    const bool isSingle = object.count == sizeof(float);
    return PropertyValue::real(
        isSingle ? static_cast<double>(std::bit_cast<float>(static_cast<std::uint32_t>(bits)))
                 : std::bit_cast<double>(bits));
}

PropertyValue TreeBuilder::string(const Object& object)
{
    const ByteView content = _objects.content(object);
    // Two bytes of UTF-16 are at most three of UTF-8.
    const std::size_t length =
        object.type == Type::AsciiString ? content.size() : content.size() / 2 * 3;
    if (!spend(Memory::text(length), object))
        return {};
    if (object.type == Type::AsciiString) {
        const auto isAscii = [](std::uint8_t byte) { return byte < 0x80; };
        const auto wrong = std::find_if_not(content.begin(), content.end(), isAscii);
        if (wrong != content.end())
            return fail("an ASCII text holds another byte",
                        object.content + static_cast<std::size_t>(wrong - content.begin()));
        return PropertyValue(std::string(content.begin(), content.end()));
    }
    return PropertyValue(utf8FromUtf16(content, std::endian::big));
}

PropertyValue TreeBuilder::array(const Object& object)
{
    if (!spend(Memory::array() + Memory::allocation(object.count * Memory::kElementBytes), object))
        return {};
    PropertyValue array = PropertyValue::newArray();
    array.asArray()->reserve(object.count);
    for (std::size_t n = 0; n < object.count; ++n) {
        PropertyValue element = referenced(object, n);
        if (!element)
            return {};
        array.asArray()->append(std::move(element));
    }
    return array;
}

PropertyValue TreeBuilder::dictionary(const Object& object)
{
    const bool isIndexed = object.count >= Memory::kIndexedEntries;
    if (!spend(Memory::dictionary() + Memory::allocation(object.count * Memory::kEntryBytes) +
                   (isIndexed ? object.count * Memory::kIndexBytes : 0),
               object))
        return {};
    PropertyValue dictionary = PropertyValue::newDictionary();
    dictionary.asDictionary()->reserve(object.count);
    for (std::size_t n = 0; n < object.count; ++n) {
        const PropertyValue key = referenced(object, n, Use::Key);
        PropertyValue element = key ? referenced(object, object.count + n) : PropertyValue();
        // A large dictionary keeps its keys twice.
        if (!element || (isIndexed && !spend(Memory::text(key.asString()->size()), object)))
            return {};
        dictionary.asDictionary()->set(*key.asString(), std::move(element));
    }
    return dictionary;
}

PropertyValue TreeBuilder::referenced(const Object& container, std::size_t n, Use use)
{
    const std::size_t offset = _objects.referenceOffset(container, n);
    const std::optional<std::size_t> index = _objects.reference(container, n);
    if (!index)
        return fail("reference to no object", offset);
    const Type type = _objects[*index].type;
    if (use == Use::Key && type != Type::AsciiString && type != Type::Utf16String)
        return fail("reference to a dictionary key that is not a string", offset);
    return value(*index);
}

} // namespace

PropertyListResult readBinaryPropertyList(ByteView bytes) { return TreeBuilder(bytes).read(); }

} // namespace orvane
