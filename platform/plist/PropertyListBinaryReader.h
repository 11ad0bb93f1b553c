#pragma once

#include "platform/base/Bytes.h"
#include "platform/plist/PropertyList.h"

namespace orvane
{

// What the values that a binary list stands for may cost in memory: many references to one object
// are legitimate, but each makes a value of its own, so a few bytes could stand for a tree without
// bound. The costs are estimates of what any value and a container take beside their content.
constexpr std::size_t kBinaryValueCost = 40;
constexpr std::size_t kBinaryContainerCost = 100;
constexpr std::size_t kBinaryCostLimit = std::size_t{1} << 20; // and for each byte of the list:
constexpr std::size_t kBinaryCostLimitPerByte = 48;

// Reads the binary form, all its integers big-endian: "bplist00", the objects, the table of their
// offsets, and a trailer of 32 bytes that says where the table is.
//
// An array or dictionary that is referenced several times becomes as many independent ones, as if
// it had been written out each time: nothing in the result is shared. A set becomes an array.
// Refused are null, UID and other objects, objects that overlap (referenced or not), references
// that form a cycle, and lists whose values would cost more than the limit above. Errors end in
// "at byte N".
PropertyListResult readBinaryPropertyList(ByteView bytes);

} // namespace orvane
