#include "app/program/Display.h"

#include <cerrno>
#include <cstddef>
#include <cstdlib>
#include <cstring>
#include <string>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

namespace orvane
{

namespace
{

std::string environment(const char* name)
{
    const char* value = std::getenv(name);
    return value ? value : "";
}

// A path that begins with NUL names an abstract socket.
bool isAnswering(const std::string& path)
{
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    if (path.size() >= sizeof address.sun_path)
        return false;
    std::memcpy(address.sun_path, path.data(), path.size());
    const int descriptor = socket(AF_UNIX, SOCK_STREAM | SOCK_CLOEXEC | SOCK_NONBLOCK, 0);
    if (descriptor < 0)
        return false;
    const auto length =
        static_cast<socklen_t>(offsetof(sockaddr_un, sun_path) + path.size() + (path[0] ? 1 : 0));
    const bool connects =
        connect(descriptor, reinterpret_cast<const sockaddr*>(&address), length) == 0 ||
        errno == EAGAIN; // somebody listens and is busy
    close(descriptor);
    return connects;
}

bool hasWaylandDisplay()
{
    const std::string name = environment("WAYLAND_DISPLAY");
    if (name.empty())
        return false;
    return isAnswering(name[0] == '/' ? name : environment("XDG_RUNTIME_DIR") + "/" + name);
}

bool hasXDisplay()
{
    const std::string name = environment("DISPLAY");
    if (name.empty() || name[0] != ':')
        // On another host or through a tunnel. Assumed to exist.
        return !name.empty();
    const std::string path = "/tmp/.X11-unix/X" + name.substr(1, name.find('.') - 1);
    return isAnswering(path) || isAnswering(std::string(1, '\0') + path);
}

} // namespace

bool hasDisplay()
{
    return !environment("QT_QPA_PLATFORM").empty() || hasWaylandDisplay() || hasXDisplay();
}

} // namespace orvane
