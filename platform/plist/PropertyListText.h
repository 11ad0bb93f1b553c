#pragma once

#include "platform/base/Bytes.h"

#include <bit>
#include <cstddef>
#include <string>
#include <string_view>

namespace orvane
{

// UTF-16 as UTF-8. A surrogate without its partner becomes U+FFFD, as does half a code unit at the
// end. Takes memory for exactly the text.
std::string utf8FromUtf16(ByteView bytes, std::endian order);

// The text in quotation marks for an error message: on one line, and cut if it is long.
std::string quotedExcerpt(std::string_view text);

} // namespace orvane
