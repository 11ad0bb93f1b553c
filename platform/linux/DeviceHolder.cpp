#include "platform/linux/DeviceHolder.h"

#include <algorithm>
#include <filesystem>
#include <fstream>
#include <sys/stat.h>
#include <unistd.h>

namespace orvane
{

namespace
{

namespace fs = std::filesystem;

bool isProcess(const fs::path& directory)
{
    const std::string name = directory.filename().string();
    return !name.empty() &&
           std::all_of(name.begin(), name.end(), [](char c) { return c >= '0' && c <= '9'; });
}

bool holds(const fs::path& process, dev_t device)
{
    std::error_code error;
    for (fs::directory_iterator each(process / "fd", error), end; !error && each != end;
         each.increment(error)) {
        struct stat status {
        };
        if (::stat(each->path().c_str(), &status) == 0 && S_ISCHR(status.st_mode) &&
            status.st_rdev == device)
            return true;
    }
    return false;
}

} // namespace

std::string programThatHolds(const std::string& devicePath)
{
    struct stat device {
    };
    if (::stat(devicePath.c_str(), &device) != 0 || !S_ISCHR(device.st_mode))
        return "";
    const std::string self = std::to_string(::getpid());
    std::error_code error;
    for (fs::directory_iterator each("/proc", error), end; !error && each != end;
         each.increment(error)) {
        const fs::path& process = each->path();
        if (!isProcess(process) || process.filename() == self || !holds(process, device.st_rdev))
            continue;
        std::string name = "a program";
        std::ifstream comm(process / "comm");
        std::getline(comm, name);
        return name + " (process " + process.filename().string() + ")";
    }
    return "";
}

} // namespace orvane
