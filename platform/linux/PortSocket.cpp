#include "platform/linux/PortSocket.h"

#include "platform/linux/UnixSocket.h"

#include <cerrno>
#include <chrono>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <thread>
#include <utility>

namespace orvane
{

namespace
{

constexpr int kBacklog = 4096;

// Names are held for well under a millisecond, so the lock is as good as free; the limit is for a
// holder that has been stopped in the midst of it.
constexpr int kLockAttempts = 1000;

// Holds the lock while it lives; none if it could not be had.
FileDescriptor lockDirectory(const std::string& directory, std::string& error)
{
    FileDescriptor opened(::open(directory.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (!opened) {
        error = "The ports directory " + directory + " cannot be opened: " + errorText(errno);
        return {};
    }
    for (int attempt = 0; attempt < kLockAttempts; ++attempt) {
        if (::flock(opened.get(), LOCK_EX | LOCK_NB) == 0)
            return opened;
        if (errno != EWOULDBLOCK && errno != EINTR)
            break;
        std::this_thread::sleep_for(std::chrono::milliseconds{1});
    }
    error = "The ports directory " + directory + " cannot be locked: " + errorText(errno);
    return {};
}

// 0 or errno.
int bindTo(int socket, const sockaddr_un& address)
{
    const auto* generic = reinterpret_cast<const sockaddr*>(&address);
    return ::bind(socket, generic, sizeof address) == 0 ? 0 : errno;
}

// Makes way for a new socket where a listener has left its file behind. 0 or errno.
int removeStale(const std::string& path, const sockaddr_un& address)
{
    struct stat found {
    };
    if (::lstat(path.c_str(), &found) != 0)
        return errno == ENOENT ? 0 : errno;
    if (!S_ISSOCK(found.st_mode))
        return EEXIST;
    const FileDescriptor probe = newStreamSocket();
    if (!probe)
        return errno;
    const int probed = connectTo(probe.get(), address);
    if (probed == 0 || probed == EAGAIN || probed == EINPROGRESS)
        return EADDRINUSE;
    if (probed != ECONNREFUSED && probed != ENOENT)
        return probed;
    return ::unlink(path.c_str()) == 0 || errno == ENOENT ? 0 : errno;
}

std::string reason(const std::string& path, int error)
{
    if (error == EADDRINUSE)
        return "The port " + path +
               " is in use by a running program: end that, or choose another directory with "
               "--ports DIR";
    if (error == EEXIST)
        return "The port " + path + " cannot be made: something else has that name.";
    return "The port " + path + " cannot be made: " + errorText(error);
}

} // namespace

PortSocket::PortSocket(std::string directory, std::string path, FileDescriptor socket)
    : _directory(std::move(directory)), _path(std::move(path)), _socket(std::move(socket))
{
    struct stat own {
    };
    if (::lstat(_path.c_str(), &own) == 0) {
        _device = own.st_dev;
        _inode = own.st_ino;
    }
}

std::optional<PortSocket> PortSocket::claim(const std::string& directory, const std::string& name,
                                            std::string& error)
{
    const std::string path = directory + '/' + name;
    const auto address = socketAddress(path, error);
    if (!address)
        return std::nullopt;
    FileDescriptor lock = lockDirectory(directory, error);
    if (!lock)
        return std::nullopt;
    FileDescriptor socket = newStreamSocket();
    int failure = socket ? bindTo(socket.get(), *address) : errno;
    if (failure == EADDRINUSE) {
        failure = removeStale(path, *address);
        if (failure == 0)
            failure = bindTo(socket.get(), *address);
    }
    if (failure == 0) {
        // From here on the destructor removes the file.
        PortSocket claimed(directory, path, std::move(socket));
        if (::listen(claimed.descriptor(), kBacklog) == 0)
            return claimed;
        failure = errno;
        lock.reset(); // the destructor takes it
    }
    error = reason(path, failure);
    return std::nullopt;
}

PortSocket::~PortSocket()
{
    if (!_socket)
        return;
    // The socket is still open, so that no other file can have got its inode number. Without the
    // lock the file stays behind, stale.
    std::string error;
    const FileDescriptor lock = lockDirectory(_directory, error);
    struct stat found {
    };
    if (lock && ::lstat(_path.c_str(), &found) == 0 && found.st_dev == _device &&
        found.st_ino == _inode)
        ::unlink(_path.c_str());
}

} // namespace orvane
