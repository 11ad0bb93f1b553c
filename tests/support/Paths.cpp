#include "support/Paths.h"

namespace orvane
{

std::string testDataPath(const std::string& fileName)
{
    return std::string(ORVANE_TEST_DATA) + "/" + fileName;
}

std::string shippedResourcesPath() { return ORVANE_RESOURCES; }

} // namespace orvane
