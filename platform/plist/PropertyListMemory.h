#pragma once

#include "platform/base/PropertyValue.h"

#include <algorithm>
#include <cstddef>
#include <string>

namespace orvane
{

// How much memory the values of a list may still take. A short list can stand for many values: of a
// binary list by references to the same object, of an XML list by elements of few characters. With
// what the readers take themselves, the limit is below 64 MiB plus 20 times the list's size.
//
// What is spent is what the values take of the heap, or a little more.
class PropertyListMemory
{
public:
    static constexpr std::size_t kLimit = std::size_t{32} << 20; // and for each byte of the list:
    static constexpr std::size_t kLimitPerByte = 16;

    explicit PropertyListMemory(std::size_t listBytes) : _left(kLimit + kLimitPerByte * listBytes)
    {
    }

    // Whether so many bytes are within the limit. To be asked before they are taken.
    [[nodiscard]] bool spend(std::size_t bytes)
    {
        if (bytes > _left)
            return false;
        _left -= bytes;
        return true;
    }

    // What an allocation takes of the heap: a header before it, rounded up.
    static constexpr std::size_t allocation(std::size_t size)
    {
        return size == 0 ? 0 : std::max<std::size_t>(32, (size + 8 + 15) / 16 * 16);
    }
    // What a text takes beside the value that holds it: nothing where it is short, and room for 30
    // characters at least where it grows beyond that.
    static constexpr std::size_t text(std::size_t length)
    {
        constexpr std::size_t kLengthInPlace = 15;
        return length <= kLengthInPlace ? 0 : allocation(std::max(length, 2 * kLengthInPlace) + 1);
    }
    static constexpr std::size_t array() { return shared(sizeof(PropertyArray)); }
    static constexpr std::size_t dictionary() { return shared(sizeof(PropertyDictionary)); }
    static constexpr std::size_t data(std::size_t size)
    {
        return shared(sizeof(Bytes)) + allocation(size);
    }
    static constexpr std::size_t largeNumber(std::size_t digits)
    {
        return shared(sizeof(PropertyLargeNumber)) + text(digits);
    }

    static constexpr std::size_t kElementBytes = sizeof(PropertyValue);
    static constexpr std::size_t kEntryBytes = sizeof(std::string) + sizeof(PropertyValue);
    // A dictionary of so many entries has an index, which takes this for each, and the key again.
    static constexpr std::size_t kIndexedEntries = 32;
    static constexpr std::size_t kIndexBytes = 96;

private:
    static constexpr std::size_t shared(std::size_t size) { return allocation(16 + size); }

    std::size_t _left;
};

} // namespace orvane
