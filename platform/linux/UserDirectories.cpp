#include "platform/linux/UserDirectories.h"

#include <cstdlib>

namespace orvane
{

std::string runtimeDirectory()
{
    const char* value = std::getenv("XDG_RUNTIME_DIR");
    return value && *value == '/' ? value : "";
}

} // namespace orvane
