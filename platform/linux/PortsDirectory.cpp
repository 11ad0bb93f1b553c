#include "platform/linux/PortsDirectory.h"

#include "platform/linux/FileDescriptor.h"
#include "platform/linux/UnixSocket.h"

#include <cerrno>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <sys/stat.h>
#include <sys/un.h>
#include <system_error>

namespace orvane
{

namespace
{

constexpr mode_t kPrivate = 0700;

std::string environment(const char* name)
{
    const char* value = std::getenv(name);
    return value ? value : "";
}

// $XDG_RUNTIME_DIR, which counts only where it is absolute.
std::string runtimeDirectory()
{
    std::string directory = environment("XDG_RUNTIME_DIR");
    return directory.starts_with('/') ? directory : "";
}

struct Place {
    std::string path;
    bool makesParents; // somebody has asked for this very path
};

Place locate(std::string_view option)
{
    if (!option.empty())
        return {std::string(option), true};
    if (std::string named = environment("ORVANE_PORTS"); !named.empty())
        return {std::move(named), true};
    if (const std::string runtime = runtimeDirectory(); !runtime.empty())
        return {runtime + "/telephony", false};
    return {"/tmp/telephony-" + std::to_string(::geteuid()), false};
}

// 0 or errno. One that is there already is fine.
int makeDirectory(const std::string& path)
{
    return ::mkdir(path.c_str(), kPrivate) == 0 || errno == EEXIST ? 0 : errno;
}

int makeWithParents(const std::string& path)
{
    for (std::size_t slash = path.find('/', 1); slash != std::string::npos;
         slash = path.find('/', slash + 1))
        if (const int failure = makeDirectory(path.substr(0, slash)); failure != 0)
            return failure;
    return makeDirectory(path);
}

std::string elsewhere() { return "choose another with --ports DIR."; }

// The longest path that leaves room in a socket address for "/", the longest name that Orvane gives
// a port ("OrvaneApp." and a UUID) and the final NUL.
constexpr std::size_t kLongestPath = sizeof(sockaddr_un::sun_path) - 1 - 46 - 1;

// What is wrong with the directory; empty if nothing is.
std::string objection(const std::string& path)
{
    const std::string name = "The ports directory " + path;
    if (path.size() > kLongestPath)
        return name + " has a longer path than the " + std::to_string(kLongestPath) +
               " bytes that leave room for the names of ports; " + elsewhere();
    const uid_t user = ::geteuid();
    struct stat found {
    };
    if (::lstat(path.c_str(), &found) != 0)
        return name + " cannot be used (" + errorText(errno) + "); " + elsewhere();
    if (S_ISLNK(found.st_mode) && found.st_uid != user && found.st_uid != 0)
        return name + " is a symbolic link of user " + std::to_string(found.st_uid) + "; " +
               elsewhere();
    const FileDescriptor opened(::open(path.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (!opened && errno == ENOTDIR)
        return name + " is not a directory; " + elsewhere();
    if (!opened || ::fstat(opened.get(), &found) != 0)
        return name + " cannot be used (" + errorText(errno) + "); " + elsewhere();
    if (found.st_uid != user)
        return name + " belongs to user " + std::to_string(found.st_uid) + "; " + elsewhere();
    if ((found.st_mode & (S_IWGRP | S_IWOTH)) != 0)
        return name + " can be written by its group or by others; take that away with chmod go-w " +
               path + " or " + elsewhere();
    return {};
}

} // namespace

std::optional<PortsDirectory> PortsDirectory::open(std::string_view option, std::string& error)
{
    auto [path, makesParents] = locate(option);
    while (path.size() > 1 && path.ends_with('/'))
        path.pop_back(); // behind which a symbolic link would hide
    if (const int failure = makesParents ? makeWithParents(path) : makeDirectory(path);
        failure != 0) {
        error = "The ports directory " + path + " cannot be made (" + errorText(failure) + "); " +
                elsewhere();
        return std::nullopt;
    }
    if (std::string text = objection(path); !text.empty()) {
        error = std::move(text);
        return std::nullopt;
    }
    return PortsDirectory(path);
}

PrivatePortsDirectory::PrivatePortsDirectory()
{
    for (const std::string& base : {runtimeDirectory(), std::string("/tmp")}) {
        std::string path = base + "/orvane-XXXXXX";
        if (base.empty() || path.size() > kLongestPath)
            continue;
        if (::mkdtemp(path.data())) {
            _path = std::move(path);
            return;
        }
    }
    throw std::system_error(errno, std::generic_category(), "/tmp");
}

PrivatePortsDirectory::~PrivatePortsDirectory()
{
    std::error_code ignored;
    std::filesystem::remove_all(_path, ignored);
}

} // namespace orvane
