#pragma once

#include "platform/base/Bytes.h"
#include "platform/plist/PropertyList.h"

namespace orvane
{

// Reads the binary form, all its integers big-endian: "bplist00", the objects, the table of their
// offsets, and a trailer of 32 bytes that says where the table is.
//
// Nothing in the result is shared: an array or dictionary that is referenced several times becomes
// several independent ones. A set becomes an array. Refused are null, UID and other objects,
// objects that overlap (referenced or not), references that form a cycle, and lists whose values
// would take more memory than PropertyListMemory allows. Errors end in "at byte N".
PropertyListResult readBinaryPropertyList(ByteView bytes);

} // namespace orvane
