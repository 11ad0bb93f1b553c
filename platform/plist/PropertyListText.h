#pragma once

#include "platform/base/Bytes.h"

#include <bit>
#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

struct Utf16Conversion {
    std::optional<std::string> text; // UTF-8; nothing when the bytes are malformed
    std::size_t faultOffset = 0;     // then the byte offset of the first code unit that is wrong
};

// UTF-16 as UTF-8. Malformed are a surrogate without its partner and half a code unit at the end.
Utf16Conversion utf8FromUtf16(ByteView bytes, std::endian order);

// The text between quotation marks for an error line: on one line, and cut where it is long.
std::string quotedExcerpt(std::string_view text);

} // namespace orvane
