#include "platform/linux/UnixSocket.h"

#include <cerrno>
#include <cstring>
#include <system_error>

namespace orvane
{

std::string errorText(int error) { return std::generic_category().message(error); }

std::optional<sockaddr_un> socketAddress(const std::string& path, std::string& error)
{
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    if (path.size() >= sizeof address.sun_path) {
        error = "The path " + path + " is longer than the " +
                std::to_string(sizeof address.sun_path - 1) +
                " bytes that a socket can have; choose a shorter directory with --ports DIR.";
        return std::nullopt;
    }
    std::memcpy(address.sun_path, path.c_str(), path.size() + 1);
    return address;
}

void enlargeBuffers(int socket)
{
    // As much as the system allows: it counts a small message as many times its size.
    const int bytes = 1024 * 1024;
    ::setsockopt(socket, SOL_SOCKET, SO_SNDBUF, &bytes, sizeof bytes);
    ::setsockopt(socket, SOL_SOCKET, SO_RCVBUF, &bytes, sizeof bytes);
}

FileDescriptor newStreamSocket()
{
    FileDescriptor made(::socket(AF_UNIX, SOCK_STREAM | SOCK_NONBLOCK | SOCK_CLOEXEC, 0));
    if (made)
        enlargeBuffers(made.get());
    return made;
}

int connectTo(int socket, const sockaddr_un& address)
{
    // The call takes addresses of all families as this type.
    const auto* generic = reinterpret_cast<const sockaddr*>(&address);
    while (::connect(socket, generic, sizeof address) != 0)
        if (errno != EINTR)
            return errno;
    return 0;
}

} // namespace orvane
