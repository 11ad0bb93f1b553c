#pragma once

#include "platform/base/PropertyValue.h"

#include <algorithm>
#include <cstddef>
#include <string>

namespace orvane
{

// How much memory the values of a list may still take. A short list can stand for many values: a
// binary list by references to the same object, an XML list by elements of few characters. Together
// with the readers' own memory, the limit is below 64 MiB plus 20 times the list's size.
//
// The sizes below are what values take of the heap, or a little more.
class PropertyListMemory
{
public:
    static constexpr std::size_t kLimit = std::size_t{32} << 20; // and for each byte of the list:
    static constexpr std::size_t kLimitPerByte = 16;

    explicit PropertyListMemory(std::size_t listBytes) : _left(kLimit + kLimitPerByte * listBytes)
    {
    }

    // Returns whether so many bytes are within the limit. Call it before they are taken.
    [[nodiscard]] bool spend(std::size_t bytes)
    {
        if (bytes > _left)
            return false;
        _left -= bytes;
        return true;
    }

    // The size of an allocation with its header, rounded up as the heap does.
    static constexpr std::size_t allocation(std::size_t size)
    {
        return size == 0 ? 0 : std::max<std::size_t>(32, (size + 8 + 15) / 16 * 16);
    }
    // What a text takes in addition to its value: nothing if it is short, else room for at least 30
    // characters.
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
    // A dictionary of so many entries or more has an index, with this and a copy of the key an
    // entry.
    static constexpr std::size_t kIndexedEntries = 32;
    static constexpr std::size_t kIndexBytes = 96;

private:
    static constexpr std::size_t shared(std::size_t size) { return allocation(16 + size); }

    std::size_t _left;
};

} // namespace orvane
