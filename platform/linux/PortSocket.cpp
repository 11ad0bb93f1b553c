#include "platform/linux/PortSocket.h"

#include "platform/base/TelephonyConstants.h"
#include "platform/linux/StalePorts.h"
#include "platform/linux/UnixSocket.h"

#include <array>
#include <cerrno>
#include <cstdio>
#include <fcntl.h>
#include <string_view>
#include <sys/random.h>
#include <sys/stat.h>
#include <utility>

namespace orvane
{

namespace
{

constexpr int kBacklog = 4096;
constexpr mode_t kSharedSocketMode = 0660;

// Each failed attempt means that another program has taken or left the name meanwhile.
constexpr int kAttempts = 100;

std::string randomText()
{
    constexpr std::string_view kDigits = "abcdefghijklmnopqrstuvwxyz234567";
    std::array<unsigned char, 10> random{};
    std::string text;
    if (::getrandom(random.data(), random.size(), 0) != static_cast<::ssize_t>(random.size()))
        random[0] = static_cast<unsigned char>(::getpid()); // the next attempt tries another name
    for (const unsigned char byte : random)
        text += kDigits[byte % kDigits.size()];
    return text;
}

// A name of the directory that nothing has.
std::string temporaryPath(const PortsDirectory& directory)
{
    return directory.pathOf(kUnpublishedPrefix + randomText());
}

// Where a stale file of that inode is moved to. The same for every program.
std::string asidePath(const PortsDirectory& directory, ino_t inode)
{
    return directory.pathOf(kUnpublishedPrefix + std::to_string(inode));
}

// Returns 0 or errno; EEXIST when there is a file of the new name.
int renameWithoutReplacing(const std::string& from, const std::string& to)
{
    return ::renameat2(AT_FDCWD, from.c_str(), AT_FDCWD, to.c_str(), RENAME_NOREPLACE) == 0 ? 0
                                                                                            : errno;
}

// Whether the owner of a shared directory claims the name that is his alone.
bool isOwnersName(const PortsDirectory& directory, const std::string& name)
{
    return directory.isShared() && name == kTelephonyServerPort;
}

// Returns 0 where the file may be moved aside, else errno.
int checkObstacle(const PortsDirectory& directory, const std::string& name, int pinned,
                  const struct stat& found)
{
    const bool isOwn = found.st_uid == ::geteuid();
    if (isOwnersName(directory, name) && !isOwn)
        return 0;
    if (!S_ISSOCK(found.st_mode))
        return EEXIST;
    std::string ignored;
    // By way of its descriptor, so that what is probed is the file that `found` describes.
    const auto address = socketAddress("/proc/self/fd/" + std::to_string(pinned), ignored);
    const FileDescriptor probe = newStreamSocket();
    if (!probe || !address)
        return errno;
    const int probed = connectTo(probe.get(), *address);
    if (probed == 0 || probed == EAGAIN || probed == EINPROGRESS)
        return EADDRINUSE;
    if (probed != ECONNREFUSED)
        return probed;
    return isOwn || directory.isOwn() ? 0 : EPERM;
}

// Makes way for a new socket where a listener has left its file behind. Returns 0, after which the
// name may have been taken again, or errno.
int makeWay(const PortsDirectory& directory, const std::string& name)
{
    const std::string path = directory.pathOf(name);
    // Keeps the inode number from being given to another file.
    const FileDescriptor pinned(::open(path.c_str(), O_PATH | O_NOFOLLOW | O_CLOEXEC));
    struct stat found {
    };
    if (!pinned || ::fstat(pinned.get(), &found) != 0)
        return errno == ENOENT ? 0 : errno;
    if (const int refused = checkObstacle(directory, name, pinned.get(), found); refused != 0)
        return refused;
    const std::string aside = asidePath(directory, found.st_ino);
    const int failure = renameWithoutReplacing(path, aside);
    if (failure != EEXIST)
        return failure == ENOENT ? 0 : failure;
    // Either somebody else has moved the same file, or another file stands in the way.
    struct stat moved {
    };
    if (::lstat(aside.c_str(), &moved) == 0 && moved.st_ino != found.st_ino)
        renameWithoutReplacing(aside, temporaryPath(directory));
    return 0;
}

// Returns the listening socket, or none with errno in `failure`.
FileDescriptor listenAt(const PortsDirectory& directory, const std::string& path, int& failure)
{
    failure = 0;
    std::string ignored;
    const auto address = socketAddress(path, ignored);
    FileDescriptor socket = newStreamSocket();
    const auto* generic = reinterpret_cast<const sockaddr*>(address ? &*address : nullptr);
    if (!address) {
        failure = ENAMETOOLONG;
    } else if (!socket || ::bind(socket.get(), generic, sizeof *address) != 0) {
        failure = errno;
    } else if ((directory.isShared() &&
                (::lchown(path.c_str(), static_cast<uid_t>(-1), directory.group()) != 0 ||
                 ::chmod(path.c_str(), kSharedSocketMode) != 0)) ||
               ::listen(socket.get(), kBacklog) != 0) {
        failure = errno;
        ::unlink(path.c_str());
    }
    return failure == 0 ? std::move(socket) : FileDescriptor();
}

// Returns 0 or errno.
int publish(const PortsDirectory& directory, const std::string& temporary, const std::string& name)
{
    for (int attempt = 0; attempt < kAttempts; ++attempt) {
        int failure = renameWithoutReplacing(temporary, directory.pathOf(name));
        if (failure == EEXIST)
            failure = makeWay(directory, name);
        else
            return failure;
        if (failure != 0)
            return failure;
    }
    return EADDRINUSE;
}

std::string reason(const PortsDirectory& directory, const std::string& name, int error)
{
    const std::string port = "The port " + directory.pathOf(name);
    if (error == EADDRINUSE)
        return port + " is in use by a running program: end that, or choose another directory with "
                      "--ports DIR";
    if (error == EEXIST)
        return port + " cannot be made: something else has that name.";
    if (error == EPERM)
        return port + " cannot be made: another user has that name.";
    return port + " cannot be made: " + errorText(error);
}

} // namespace

PortSocket::PortSocket(std::string path, FileDescriptor socket)
    : _path(std::move(path)), _socket(std::move(socket))
{
    struct stat own {
    };
    if (::lstat(_path.c_str(), &own) == 0) {
        _device = own.st_dev;
        _inode = own.st_ino;
    }
}

std::optional<PortSocket> PortSocket::claim(const PortsDirectory& directory,
                                            const std::string& name, std::string& error)
{
    if (!socketAddress(directory.pathOf(name), error) ||
        !socketAddress(temporaryPath(directory), error))
        return std::nullopt;
    if (isOwnersName(directory, name) && !directory.isOwn()) {
        error = "Only the owner of the ports directory " + directory.path() +
                " can be the telephony server there; choose another with --ports DIR.";
        return std::nullopt;
    }
    int failure = 0;
    FileDescriptor socket;
    std::string temporary;
    for (int attempt = 0; attempt < kAttempts && !socket; ++attempt) {
        temporary = temporaryPath(directory);
        socket = listenAt(directory, temporary, failure);
        if (!socket && failure != EADDRINUSE)
            break;
    }
    if (socket) {
        // Removes the file at its end, wherever that is: it has one of the two names.
        PortSocket claimed(temporary, std::move(socket));
        failure = publish(directory, temporary, name);
        if (failure == 0) {
            claimed._path = directory.pathOf(name);
            return claimed;
        }
    }
    error = reason(directory, name, failure);
    return std::nullopt;
}

PortSocket::~PortSocket()
{
    if (!_socket)
        return;
    // The socket is still open, so that no other file can have got its inode number.
    struct stat found {
    };
    if (::lstat(_path.c_str(), &found) == 0 && found.st_dev == _device && found.st_ino == _inode)
        ::unlink(_path.c_str());
}

} // namespace orvane
