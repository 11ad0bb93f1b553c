#include "platform/linux/PrivatePortsDirectory.h"

#include "platform/base/TelephonyConstants.h"
#include "platform/linux/StalePorts.h"
#include "platform/linux/UserDirectories.h"

#include <cerrno>
#include <cstdlib>
#include <filesystem>
#include <sys/stat.h>
#include <system_error>
#include <unistd.h>
#include <vector>

namespace orvane
{

namespace
{

constexpr const char* kPrefix = "orvane-";
constexpr const char* kRandomPart = "XXXXXX";

// The longest base directory below which a socket's address holds the longest name of a port.
constexpr std::size_t kLongestBase = 45;

std::vector<std::string> baseDirectories()
{
    std::vector<std::string> bases;
    if (std::string runtime = runtimeDirectory();
        !runtime.empty() && runtime.size() <= kLongestBase)
        bases.push_back(std::move(runtime));
    bases.emplace_back("/tmp");
    return bases;
}

std::string makePrivateDirectory()
{
    for (const std::string& base : baseDirectories()) {
        std::string path = base + '/' + kPrefix + kRandomPart;
        if (::mkdtemp(path.data()))
            return path;
    }
    throw std::system_error(errno, std::generic_category(), "/tmp");
}

bool hasPrivateName(const std::string& name)
{
    const std::string_view prefix = kPrefix;
    return name.starts_with(prefix) &&
           name.size() == prefix.size() + std::string_view(kRandomPart).size();
}

bool isAbandoned(const std::string& path, std::time_t now)
{
    struct stat found {
    };
    if (::lstat(path.c_str(), &found) != 0 || !S_ISDIR(found.st_mode) ||
        found.st_uid != ::geteuid() || (found.st_mode & 07777) != 0700)
        return false;
    std::error_code error;
    bool hasServer = false;
    for (const auto& entry : std::filesystem::directory_iterator(path, error)) {
        if (!isStaleSocket(entry.path().string()))
            return false;
        hasServer = hasServer || entry.path().filename() == kTelephonyServerPort;
    }
    // A program that has just started has no server yet.
    return !error && (hasServer || now - found.st_ctime > kYoungSeconds);
}

} // namespace

PrivatePortsDirectory::PrivatePortsDirectory()
    : _directory(PortsDirectory::unchecked(makePrivateDirectory()))
{
}

PrivatePortsDirectory::~PrivatePortsDirectory()
{
    std::error_code ignored;
    std::filesystem::remove_all(path(), ignored);
}

void PrivatePortsDirectory::removeAbandoned(std::time_t now)
{
    for (const std::string& base : baseDirectories()) {
        std::error_code error;
        for (const auto& entry : std::filesystem::directory_iterator(base, error))
            if (hasPrivateName(entry.path().filename().string()) &&
                isAbandoned(entry.path().string(), now)) {
                std::error_code ignored;
                std::filesystem::remove_all(entry.path(), ignored);
            }
    }
}

} // namespace orvane
