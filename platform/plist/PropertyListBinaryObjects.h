#pragma once

#include "platform/base/Bytes.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace orvane
{

// The big-endian integer without sign in `bytes`, of which there are at most 8.
std::uint64_t bigEndian(ByteView bytes);

// The objects of a binary property list: where each is, and how long. Their values are not read
// yet. Every range below lies within the list's object bytes, and no two objects overlap.
class PropertyListBinaryObjects
{
public:
    enum class Type : std::uint8_t {
        False,
        True,
        Integer,
        Real,
        Date,
        Data,
        AsciiString,
        Utf16String,
        Array,
        Dictionary
    };
    struct Object {
        std::size_t begin;   // of the whole object
        std::size_t content; // offset of what follows the marker and the count
        // Of the content: in bytes for integers, reals, dates, data and strings; in elements for
        // arrays; in entries for dictionaries (all keys' references, then all values').
        std::size_t count;
        Type type;
    };

    // Takes the list's bytes, at most 4 GiB, which must outlive this. On failure isRead() is false.
    explicit PropertyListBinaryObjects(ByteView bytes);

    [[nodiscard]] bool isRead() const { return _error.empty(); }
    [[nodiscard]] const std::string& error() const { return _error; }

    [[nodiscard]] std::size_t count() const { return _objects.size(); }
    [[nodiscard]] Object operator[](std::size_t index) const;
    [[nodiscard]] std::size_t rootIndex() const { return _root; }
    // The bytes of an object's content. Only for objects whose count is in bytes.
    [[nodiscard]] ByteView content(const Object& object) const
    {
        return _bytes.subspan(object.content, object.count);
    }
    // The object that a container's n-th reference names, or nullopt where there is no such object.
    // `n` is below the container's count, for a dictionary below twice its count.
    [[nodiscard]] std::optional<std::size_t> reference(const Object& container,
                                                       std::size_t n) const;
    // The offset of that reference.
    [[nodiscard]] std::size_t referenceOffset(const Object& container, std::size_t n) const
    {
        return container.content + n * _referenceBytes;
    }

private:
    bool fail(const char* what, std::size_t at);
    bool readTrailer();
    bool readObjects();
    bool readObject(std::size_t begin);
    bool readCount(Object& object);
    bool bound(Object object, std::size_t unitBytes);
    bool refuseOverlaps();
    [[nodiscard]] std::size_t endOf(std::size_t index) const;

    // An object in 12 bytes, since a list of one megabyte has up to 260,000 objects.
    struct Kept {
        std::uint32_t begin;
        std::uint32_t count;
        std::uint8_t contentOffset; // of the content, counted from begin
        Type type;
    };

    ByteView _bytes;
    std::size_t _offsetBytes = 0; // of one entry of the offset table
    std::size_t _referenceBytes = 0;
    std::size_t _objectCount = 0;
    std::size_t _root = 0;
    std::size_t _table = 0; // offset of the offset table, the end of the objects
    std::vector<Kept> _objects;
    std::string _error;
};

} // namespace orvane
