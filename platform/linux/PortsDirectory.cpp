#include "platform/linux/PortsDirectory.h"

#include "platform/linux/FileDescriptor.h"
#include "platform/linux/UnixSocket.h"
#include "platform/linux/UserDirectories.h"

#include <array>
#include <cerrno>
#include <cstdio>
#include <cstdlib>
#include <fcntl.h>
#include <pwd.h>
#include <sys/stat.h>
#include <sys/un.h>

namespace orvane
{

namespace
{

constexpr mode_t kPrivate = 0700;
constexpr mode_t kShared = 01770;
constexpr mode_t kPermissions = 07777;

// The longest path that leaves room in a socket address for "/", the longest name that Orvane gives
// a port ("OrvaneApp." and a UUID) and the final NUL.
constexpr std::size_t kLongestPath = sizeof(sockaddr_un::sun_path) - 1 - 46 - 1;

struct Place {
    std::string path;
    bool makesParents; // the user named this path
};

Place locate(std::string_view option)
{
    if (!option.empty())
        return {std::string(option), true};
    if (const char* named = std::getenv("ORVANE_PORTS"); named && *named)
        return {named, true};
    if (const std::string runtime = runtimeDirectory(); !runtime.empty())
        return {runtime + "/telephony", false};
    return {"/tmp/telephony-" + std::to_string(::geteuid()), false};
}

// Returns 0, also where the directory exists already, or errno.
int makeDirectory(const std::string& path)
{
    if (::mkdir(path.c_str(), kPrivate) != 0)
        return errno == EEXIST ? 0 : errno;
    // Takes away a set-group-id bit that the parent has passed on, and gives what the umask took.
    return ::chmod(path.c_str(), kPrivate) == 0 ? 0 : errno;
}

int makeWithParents(const std::string& path)
{
    for (std::size_t slash = path.find('/', 1); slash != std::string::npos;
         slash = path.find('/', slash + 1))
        if (const int failure = makeDirectory(path.substr(0, slash)); failure != 0)
            return failure;
    return makeDirectory(path);
}

// Without the trailing "/" and "/." that say nothing.
std::string trimmed(std::string path)
{
    while (path.size() > 1 && (path.ends_with('/') || path.ends_with("/.")))
        path.pop_back();
    return path;
}

std::string nameOf(const std::string& path) { return "The ports directory " + path; }

std::string refusal(const std::string& path, const std::string& problem)
{
    return nameOf(path) + ' ' + problem + "; choose another with --ports DIR.";
}

std::string modeText(mode_t mode)
{
    std::array<char, 16> text{};
    std::snprintf(text.data(), text.size(), "%04o", static_cast<unsigned>(mode));
    return text.data();
}

// The owner of somebody else's symbolic link on the way to the path. Whoever owns a link decides
// where it leads, at any time.
std::optional<uid_t> ownerOfForeignLink(const std::string& path)
{
    for (std::size_t end = path.find('/', 1);; end = path.find('/', end + 1)) {
        struct stat found {
        };
        if (::lstat(path.substr(0, end).c_str(), &found) == 0 && S_ISLNK(found.st_mode) &&
            found.st_uid != ::geteuid() && found.st_uid != 0)
            return found.st_uid;
        if (end == std::string::npos)
            return std::nullopt;
    }
}

} // namespace

std::optional<PortsDirectory> PortsDirectory::open(std::string_view option, std::string& error)
{
    Place place = locate(option);
    const std::string path = trimmed(std::move(place.path));
    if (const int failure = place.makesParents ? makeWithParents(path) : makeDirectory(path);
        failure != 0) {
        error = refusal(path, "cannot be made (" + errorText(failure) + ")");
        return std::nullopt;
    }
    return existing(path, error, systemSharedOwner());
}

bool PortsDirectory::isNamed(std::string_view option) { return locate(option).makesParents; }

std::optional<PortsDirectory> PortsDirectory::existing(std::string path, std::string& error,
                                                       std::optional<uid_t> sharedOwner)
{
    path = trimmed(std::move(path));
    const auto refused = [&](const std::string& problem) {
        error = refusal(path, problem);
        return std::nullopt;
    };
    if (path.size() > kLongestPath)
        return refused("has a longer path than the " + std::to_string(kLongestPath) +
                       " bytes that leave room for the names of ports");
    if (const auto owner = ownerOfForeignLink(path))
        return refused("is reached through a symbolic link of user " + std::to_string(*owner));
    const FileDescriptor opened(::open(path.c_str(), O_PATH | O_DIRECTORY | O_CLOEXEC));
    struct stat found {
    };
    if (!opened && errno == ENOTDIR)
        return refused("is not a directory");
    if (!opened || ::fstat(opened.get(), &found) != 0)
        return refused("cannot be used (" + errorText(errno) + ")");
    const mode_t mode = found.st_mode & kPermissions;
    const bool mayBeShared = found.st_uid == sharedOwner;
    if (mayBeShared && mode == kShared)
        return PortsDirectory(std::move(path), true, found.st_uid, found.st_gid);
    if (found.st_uid == ::geteuid() && mode == kPrivate)
        return PortsDirectory(std::move(path), false, found.st_uid, found.st_gid);
    if (mayBeShared)
        return refused("of user " + std::string(kSharedOwnerName) + " has the mode " +
                       modeText(mode) + " instead of " + modeText(kShared));
    if (found.st_uid != ::geteuid())
        return refused("belongs to user " + std::to_string(found.st_uid));
    return refused("has the mode " + modeText(mode) + " instead of " + modeText(kPrivate));
}

std::optional<uid_t> PortsDirectory::systemSharedOwner()
{
    std::array<char, 4096> buffer{};
    passwd entry{};
    passwd* found = nullptr;
    if (::getpwnam_r(kSharedOwnerName, &entry, buffer.data(), buffer.size(), &found) != 0 || !found)
        return std::nullopt;
    return found->pw_uid;
}

PortsDirectory PortsDirectory::unchecked(std::string path)
{
    return {std::move(path), false, ::geteuid(), ::getegid()};
}

bool PortsDirectory::isOwn() const { return _owner == ::geteuid(); }

bool PortsDirectory::accepts(uid_t user, gid_t primaryGroup) const
{
    return user == ::geteuid() || user == 0 || (_isShared && user == _owner) ||
           acceptsGroup(primaryGroup);
}

bool PortsDirectory::acceptsGroup(gid_t group) const
{
    return _isShared && isOwn() && group == _group;
}

} // namespace orvane
