#pragma once

#include <string>
#include <string_view>

namespace orvane
{

// Appends the text as a JSON string: quotation marks around it, control characters escaped (DEL and
// C1 too, which a terminal would obey), other non-ASCII text as UTF-8, each byte that is not part
// of well-formed UTF-8 as U+FFFD.
void appendJsonString(std::string& to, std::string_view text);

} // namespace orvane
