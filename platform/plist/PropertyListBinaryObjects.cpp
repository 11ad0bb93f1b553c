#include "platform/plist/PropertyListBinaryObjects.h"

#include <algorithm>
#include <numeric>

namespace orvane
{

namespace
{

constexpr std::size_t kMagicBytes = 8;
constexpr std::size_t kTrailerBytes = 32;

// Low half of a marker whose object's count follows as an integer object.
constexpr std::size_t kCountFollows = 15;

using Type = PropertyListBinaryObjects::Type;

// An object whose marker's low half is its count. A unit is what is counted.
struct CountedKind {
    std::uint8_t high; // half of the marker
    Type type;
    std::size_t bytesAUnit;
    std::size_t referencesAUnit;
};

constexpr CountedKind kCountedKinds[] = {
    {0x4, Type::Data,        1, 0},
    {0x5, Type::AsciiString, 1, 0},
    {0x6, Type::Utf16String, 2, 0},
    {0xA, Type::Array,       0, 1},
    {0xC, Type::Array,       0, 1}, // a set
    {0xD, Type::Dictionary,  0, 2},
};

const CountedKind* countedKind(unsigned high)
{
    for (const CountedKind& kind : kCountedKinds)
        if (kind.high == high)
            return &kind;
    return nullptr;
}

} // namespace

std::uint64_t bigEndian(ByteView bytes)
{
    std::uint64_t number = 0;
    for (const std::uint8_t byte : bytes)
        number = number << 8 | byte;
    return number;
}

PropertyListBinaryObjects::PropertyListBinaryObjects(ByteView bytes) : _bytes(bytes)
{
    if (readTrailer() && readObjects())
        refuseOverlaps();
}

bool PropertyListBinaryObjects::fail(const char* what, std::size_t at)
{
    _error = std::string(what) + " at byte " + std::to_string(at);
    return false;
}

bool PropertyListBinaryObjects::readTrailer()
{
    if (_bytes.size() < kMagicBytes + kTrailerBytes)
        return fail("binary property list cut short", _bytes.size());
    if (_bytes.size() > UINT32_MAX)
        return fail("binary property list longer than 4 GiB", _bytes.size());
    // Six unused bytes, the two widths, then three integers of 8 bytes.
    const std::size_t trailer = _bytes.size() - kTrailerBytes;
    const auto numberAt = [this](std::size_t at) { return bigEndian(_bytes.subspan(at, 8)); };
    _offsetBytes = _bytes[trailer + 6];
    _referenceBytes = _bytes[trailer + 7];
    if (_offsetBytes < 1 || _offsetBytes > 8)
        return fail("offset width out of range", trailer + 6);
    if (_referenceBytes < 1 || _referenceBytes > 8)
        return fail("reference width out of range", trailer + 7);

    const std::uint64_t objectCount = numberAt(trailer + 8);
    const std::uint64_t root = numberAt(trailer + 16);
    const std::uint64_t table = numberAt(trailer + 24);
    if (table < kMagicBytes || table > trailer)
        return fail("offset table out of range", trailer + 24);
    const std::size_t tableBytes = trailer - static_cast<std::size_t>(table);
    if (objectCount != tableBytes / _offsetBytes || tableBytes % _offsetBytes != 0)
        return fail("number of objects does not fit the offset table", trailer + 8);
    // Each object takes at least one byte, so more objects must overlap. Refused before any is
    // stored.
    if (objectCount > table - kMagicBytes)
        return fail("more objects than bytes for them", trailer + 8);
    if (root >= objectCount)
        return fail("root object out of range", trailer + 16);
    _objectCount = static_cast<std::size_t>(objectCount);
    _root = static_cast<std::size_t>(root);
    _table = static_cast<std::size_t>(table);
    return true;
}

bool PropertyListBinaryObjects::readObjects()
{
    _objects.reserve(_objectCount);
    for (std::size_t i = 0; i < _objectCount; ++i) {
        const std::size_t entry = _table + i * _offsetBytes;
        const std::uint64_t offset = bigEndian(_bytes.subspan(entry, _offsetBytes));
        if (offset < kMagicBytes || offset >= _table)
            return fail("object offset out of range", entry);
        if (!readObject(static_cast<std::size_t>(offset)))
            return false;
    }
    return true;
}

bool PropertyListBinaryObjects::readObject(std::size_t begin)
{
    const unsigned marker = _bytes[begin];
    const unsigned high = marker >> 4;
    const unsigned low = marker & 15;
    Object object{begin, begin + 1, low, Type::False};
    if (const CountedKind* const kind = countedKind(high)) {
        object.type = kind->type;
        if (low == kCountFollows && !readCount(object))
            return false;
        return bound(object, kind->bytesAUnit + kind->referencesAUnit * _referenceBytes);
    }
    if (marker == 0x08 || marker == 0x09) {
        object.type = marker == 0x08 ? Type::False : Type::True;
        object.count = 0;
        return bound(object, 1);
    }
    object.count = std::size_t{1} << low;
    if (high == 0x1 && low <= 4)
        object.type = Type::Integer;
    else if (marker == 0x22 || marker == 0x23)
        object.type = Type::Real;
    else if (marker == 0x33)
        object.type = Type::Date;
    else if (high == 0x8)
        return fail("UID objects are not accepted", begin);
    else
        return fail("object of an unknown type", begin);
    return bound(object, 1);
}

// Reads the integer object between the marker and the content.
bool PropertyListBinaryObjects::readCount(Object& object)
{
    const std::size_t at = object.content;
    if (at >= _table)
        return fail("object beyond the end of the objects", object.begin);
    const unsigned marker = _bytes[at];
    if (marker < 0x10 || marker > 0x13)
        return fail("count is not an integer", at);
    const std::size_t width = std::size_t{1} << (marker & 15);
    if (width > _table - at - 1)
        return fail("object beyond the end of the objects", object.begin);
    const std::uint64_t count = bigEndian(_bytes.subspan(at + 1, width));
    if (count > _table)
        return fail("object beyond the end of the objects", object.begin);
    object.count = static_cast<std::size_t>(count);
    object.content = at + 1 + width;
    return true;
}

// Adds the object if its content, `count` units long, lies within the objects.
bool PropertyListBinaryObjects::bound(Object object, std::size_t unitBytes)
{
    if (object.count > (_table - object.content) / unitBytes)
        return fail("object beyond the end of the objects", object.begin);
    const std::size_t contentBytes = object.count * unitBytes;
    const bool isContainer = object.type == Type::Array || object.type == Type::Dictionary;
    if (!isContainer)
        object.count = contentBytes;
    _objects.push_back({static_cast<std::uint32_t>(object.begin),
                        static_cast<std::uint32_t>(object.count),
                        static_cast<std::uint8_t>(object.content - object.begin), object.type});
    return true;
}

PropertyListBinaryObjects::Object PropertyListBinaryObjects::operator[](std::size_t index) const
{
    const Kept& kept = _objects[index];
    return {kept.begin, std::size_t{kept.begin} + kept.contentOffset, kept.count, kept.type};
}

std::size_t PropertyListBinaryObjects::endOf(std::size_t index) const
{
    const Object object = (*this)[index];
    const std::size_t references = object.type == Type::Dictionary ? 2 : 1;
    const bool isContainer = object.type == Type::Array || object.type == Type::Dictionary;
    return object.content + object.count * (isContainer ? references * _referenceBytes : 1);
}

bool PropertyListBinaryObjects::refuseOverlaps()
{
    const auto overlap = [this](std::size_t earlier, std::size_t later) {
        return _objects[later].begin < endOf(earlier) &&
               !fail("overlapping objects", _objects[later].begin);
    };
    // Most writers put objects in the order of the table.
    if (std::is_sorted(_objects.begin(), _objects.end(), [](const Kept& left, const Kept& right) {
            return left.begin < right.begin;
        })) {
        for (std::size_t i = 1; i < _objects.size(); ++i)
            if (overlap(i - 1, i))
                return false;
        return true;
    }
    std::vector<std::uint32_t> order(_objects.size());
    std::iota(order.begin(), order.end(), 0U);
    std::sort(order.begin(), order.end(), [this](std::uint32_t left, std::uint32_t right) {
        return _objects[left].begin < _objects[right].begin;
    });
    for (std::size_t i = 1; i < order.size(); ++i)
        if (overlap(order[i - 1], order[i]))
            return false;
    return true;
}

std::optional<std::size_t> PropertyListBinaryObjects::reference(const Object& container,
                                                                std::size_t n) const
{
    const std::uint64_t index =
        bigEndian(_bytes.subspan(referenceOffset(container, n), _referenceBytes));
    if (index >= _objects.size())
        return std::nullopt;
    return static_cast<std::size_t>(index);
}

} // namespace orvane
