#pragma once

#include <string_view>

namespace orvane
{

// Writes "PROGRAM: TEXT" as one line to standard error. The text may hold anything, such as the
// name of a file: it is written as printableText() makes it.
void printComplaint(std::string_view program, std::string_view text);

} // namespace orvane
