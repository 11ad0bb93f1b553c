#include "platform/linux/ResourceDirectory.h"

#include <filesystem>

namespace orvane
{

std::string resourceDirectory(const std::string& share, const std::string& sourceDirectory)
{
    std::error_code error;
    const auto program = std::filesystem::read_symlink("/proc/self/exe", error);
    const auto installed = program.parent_path().parent_path() / share;
    if (!error && std::filesystem::is_directory(installed, error))
        return installed.string();
    return sourceDirectory;
}

} // namespace orvane
