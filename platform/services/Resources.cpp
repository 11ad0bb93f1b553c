#include "platform/services/Resources.h"

#include "platform/services/FileSystem.h"

#include <algorithm>
#include <filesystem>

namespace orvane
{

std::optional<Bytes> DirectoryResources::load(std::string_view name, std::string_view type) const
{
    constexpr std::size_t kLimit = std::size_t{16} * 1024 * 1024;
    return readFile(_directory + "/" + std::string(name) + "." + std::string(type), kLimit);
}

std::vector<std::string> DirectoryResources::pathsOfType(std::string_view type) const
{
    const std::string extension = "." + std::string(type);
    std::vector<std::string> paths;
    std::error_code error;
    for (const auto& entry : std::filesystem::directory_iterator(_directory, error))
        if (entry.path().extension() == extension)
            paths.push_back(entry.path().string());
    std::sort(paths.begin(), paths.end());
    return paths;
}

} // namespace orvane
