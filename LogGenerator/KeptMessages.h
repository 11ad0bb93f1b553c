#pragma once

#include "platform/base/Bytes.h"
#include "platform/base/PropertyValue.h"

#include <cstddef>

namespace orvane
{

// How many bytes of raw messages are kept for all entries of a history together, so that memory,
// the time that saving takes and the saved file stay bounded.
inline constexpr std::size_t kMostKeptBytes = 64U << 20;

// The length of the fewest whole messages at the start of `messages` that hold `count` bytes or
// more. Lengths are taken from the messages' headers; from a message without a usable one on,
// everything counts.
std::size_t lengthOfFirstMessages(ByteView messages, std::size_t count);

// The entry, as one of whose raw messages the oldest are left out: its "Description" says so. The
// entry itself is not changed.
PropertyValue incompleteEntry(const PropertyValue& entry);
bool isIncompleteEntry(const PropertyValue& entry);

// The history with at most `limit` bytes of raw messages ("DisplayState") in all its entries: the
// oldest messages go first, whole ones. Entries that lose messages become incomplete ones. Neither
// the array nor its entries are changed.
PropertyValue boundedHistory(const PropertyValue& history, std::size_t limit);

} // namespace orvane
