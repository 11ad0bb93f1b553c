#pragma once

#include "platform/base/Bytes.h"
#include "platform/plist/PropertyList.h"

namespace orvane
{

// Reads the XML form: UTF-8, UTF-16 that starts with a byte-order mark (or, in UTF-16, with "<"),
// ISO-8859-1 or US-ASCII as the XML declaration says. No DTD is loaded; a DOCTYPE that declares an
// entity is refused. Errors end in "at line L, column C", both counted from 1, columns in
// characters.
PropertyListResult readXmlPropertyList(ByteView bytes);

} // namespace orvane
