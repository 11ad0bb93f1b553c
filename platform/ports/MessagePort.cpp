#include "platform/ports/MessagePort.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr std::size_t kPortNameLimit = 64;

// Not std::isalnum, which depends on the locale.
bool isPortNameByte(char byte)
{
    return (byte >= 'A' && byte <= 'Z') || (byte >= 'a' && byte <= 'z') ||
           (byte >= '0' && byte <= '9') || byte == '.' || byte == '-' || byte == '_';
}

} // namespace

bool isUsablePortName(std::string_view name)
{
    // The names of the directory itself and of its parent are no names of files in it.
    return !name.empty() && name.size() <= kPortNameLimit && name != "." && name != ".." &&
           std::all_of(name.begin(), name.end(), isPortNameByte);
}

} // namespace orvane
