#pragma once

#include "platform/base/PropertyValue.h"

#include <string>
#include <string_view>

namespace orvane
{

// Each makes a value from the text of an XML element. Spaces, tabs and line ends around the text
// are ignored. For a bad text each returns an absent value and sets `error`.

// Decimal or, after "0x", hexadecimal, with or without a sign. One outside 64 signed bits becomes a
// large number.
PropertyValue integerFromXml(std::string_view text, std::string& error);
// Decimal with or without an exponent, "nan", "inf" or "infinity". Not dependent on the locale. One
// that is too large, or too near to zero, for a double becomes a large number.
PropertyValue realFromXml(std::string_view text, std::string& error);
// "2026-11-21T10:00:00Z", the years 1 to 9999.
PropertyValue dateFromXml(std::string_view text, std::string& error);
// Base64 with its padding, white space anywhere.
PropertyValue dataFromXml(std::string_view text, std::string& error);

// Whether the character is one that XML counts as white space.
constexpr bool isXmlSpace(char character)
{
    return character == ' ' || character == '\t' || character == '\n' || character == '\r';
}

} // namespace orvane
