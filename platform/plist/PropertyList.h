#pragma once

#include "platform/base/PropertyValue.h"

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

// Property lists as bytes: XML (UTF-8, UTF-16 with byte-order mark, or as the XML declaration says)
// and binary ("bplist00") are read, XML is written.

// Arrays and dictionaries nested deeper than this are neither read nor written.
constexpr std::size_t kPropertyListDepthLimit = 512;

struct PropertyListResult {
    PropertyValue value; // absent when the bytes could not be read
    std::string error;   // then says what is wrong and ends in "at line L, column C" or "at byte N"
};

// Reads a whole property list of either format. Never throws on bad input, never reads outside the
// bytes, and takes memory in proportion to them. All dictionaries and arrays of the value are
// distinct. Of a key that occurs twice in a dictionary the later value stands at the earlier place.
// May be called from any thread.
PropertyListResult readPropertyList(ByteView bytes);

// The XML form, UTF-8, without a DOCTYPE line. Nothing when the value is absent, is nested too
// deeply or holds what XML cannot carry (an absent value, a text with a control character, U+FFFE,
// U+FFFF or invalid UTF-8, a date outside the years 1 to 9999); dates lose the fraction of a
// second.
std::optional<std::string> writeXmlPropertyList(const PropertyValue& value);
// The same as bytes, as messages and files carry it.
std::optional<Bytes> xmlPropertyListBytes(const PropertyValue& value);

} // namespace orvane
