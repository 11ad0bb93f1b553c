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

// The objects of a binary property list, found and bounded but not yet understood: every range
// below lies within the list's object bytes, and no two objects overlap.
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

    // Takes the list's bytes, which must outlive this. On failure isRead() is false.
    explicit PropertyListBinaryObjects(ByteView bytes);

    [[nodiscard]] bool isRead() const { return _error.empty(); }
    [[nodiscard]] const std::string& error() const { return _error; }

    [[nodiscard]] std::size_t count() const { return _objects.size(); }
    [[nodiscard]] const Object& operator[](std::size_t index) const { return _objects[index]; }
    [[nodiscard]] std::size_t rootIndex() const { return _root; }
    // The bytes of an object's content, where its count is in bytes.
    [[nodiscard]] ByteView content(const Object& object) const
    {
        return _bytes.subspan(object.content, object.count);
    }
    // The object that a container's n-th reference names, or nothing when there is no such object.
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

    ByteView _bytes;
    std::size_t _offsetBytes = 0; // of one entry of the offset table
    std::size_t _referenceBytes = 0;
    std::size_t _objectCount = 0;
    std::size_t _root = 0;
    std::size_t _table = 0; // offset of the offset table, the end of the objects
    std::vector<Object> _objects;
    std::vector<std::size_t> _ends; // of the objects
    std::string _error;
};

} // namespace orvane
