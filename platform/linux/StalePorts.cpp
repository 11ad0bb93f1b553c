#include "platform/linux/StalePorts.h"

#include "platform/base/TelephonyConstants.h"
#include "platform/linux/UnixSocket.h"

#include <cerrno>
#include <filesystem>
#include <sys/stat.h>
#include <system_error>

namespace orvane
{

namespace
{

bool isServerPort(const std::string& name) { return name.starts_with(kTelephonyServerPort); }

bool isRemovable(const std::string& path, const std::string& name, const struct stat& found,
                 StalePorts which, std::time_t now)
{
    if (name.starts_with(kUnpublishedPrefix))
        return now - found.st_ctime > kYoungSeconds;
    if (name == kTelephonyServerPort || (isServerPort(name) && which != StalePorts::All))
        return false;
    return isStaleSocket(path);
}

} // namespace

bool isStaleSocket(const std::string& path)
{
    struct stat found {
    };
    std::string ignored;
    const auto address = socketAddress(path, ignored);
    if (!address || ::lstat(path.c_str(), &found) != 0 || !S_ISSOCK(found.st_mode))
        return false;
    const FileDescriptor probe = newStreamSocket();
    return probe && connectTo(probe.get(), *address) == ECONNREFUSED;
}

void removeStalePorts(const PortsDirectory& directory, StalePorts which, std::time_t now)
{
    std::error_code error;
    for (const auto& entry : std::filesystem::directory_iterator(directory.path(), error)) {
        const std::string& path = entry.path().native();
        struct stat found {
        };
        if (::lstat(path.c_str(), &found) != 0 || !S_ISSOCK(found.st_mode))
            continue;
        if (found.st_uid != ::geteuid() && !directory.isOwn())
            continue;
        if (isRemovable(path, entry.path().filename().string(), found, which, now))
            ::unlink(path.c_str());
    }
}

} // namespace orvane
