#pragma once

#include <string>
#include <string_view>

namespace orvane
{

// The text with every byte that is not part of well-formed UTF-8 replaced by U+FFFD.
std::string validText(std::string_view text);

// The text with every byte that is not part of well-formed UTF-8, and what Unicode has no character
// for at the end of its first plane, replaced by U+FFFD, and every control character but the tab by
// a blank: fit to be shown on one line and to be stored as XML.
std::string shownText(std::string_view text);

} // namespace orvane
