#pragma once

#include "platform/base/Bytes.h"
#include "platform/plist/PropertyList.h"

namespace orvane
{

// How many bytes of memory the values of a binary list may take. Many references to one object are
// legitimate, but each makes a value of its own, so a few bytes could otherwise stand for a tree
// without bound. With the table of objects that is below 64 MiB plus 20 times the list's size.
constexpr std::size_t kBinaryMemoryLimit = std::size_t{32} << 20; // and for each byte of the list:
constexpr std::size_t kBinaryMemoryLimitPerByte = 16;

// Reads the binary form, all its integers big-endian: "bplist00", the objects, the table of their
// offsets, and a trailer of 32 bytes that says where the table is.
//
// An array or dictionary that is referenced several times becomes as many independent ones, as if
// it had been written out each time: nothing in the result is shared. A set becomes an array.
// Refused are null, UID and other objects, objects that overlap (referenced or not), references
// that form a cycle, and lists whose values would take more than the limit above. Errors end in
// "at byte N".
PropertyListResult readBinaryPropertyList(ByteView bytes);

} // namespace orvane
