#pragma once

#include "platform/PropertyValue.h"

#include <cstddef>
#include <string>
#include <string_view>

namespace orvane
{

// Property lists as bytes: XML (UTF-8, UTF-16 with byte-order mark, or as the XML declaration says)
// and binary ("bplist00") are read, XML is written.

// Arrays and dictionaries nested deeper than this are refused.
constexpr std::size_t kPropertyListDepthLimit = 512;

struct PropertyListResult {
    PropertyValue value; // absent when the bytes could not be read
    std::string error;   // then says what is wrong and at which byte offset or line
};

// Reads a whole property list of either format. Never throws on bad input, never reads outside the
// bytes, and takes memory in proportion to them.
PropertyListResult readPropertyList(ByteView bytes);

// The XML form, UTF-8, without a DOCTYPE line. Nothing when the value is absent or holds what XML
// cannot carry (an absent value, a text with a control character or invalid UTF-8, a date outside
// the years 1 to 9999); dates lose the fraction of a second.
std::optional<std::string> writeXmlPropertyList(const PropertyValue& value);

// Whether the bytes are well-formed UTF-8 (no surrogates, nothing beyond U+10FFFF).
bool isValidUtf8(std::string_view text);

} // namespace orvane
