#include "platform/services/Complaint.h"

#include "platform/base/Utf8.h"

#include <cstdio>
#include <string>

namespace orvane
{

void printComplaint(std::string_view program, std::string_view text)
{
    const std::string line = std::string(program) + ": " + printableText(text) + "\n";
    std::fwrite(line.data(), 1, line.size(), stderr);
}

} // namespace orvane
