#include "platform/linux/PortPeer.h"

#include "platform/base/TelephonyConstants.h"
#include "platform/linux/UnixSocket.h"
#include "platform/services/SystemLog.h"

#include <algorithm>
#include <cerrno>
#include <optional>
#include <sys/socket.h>
#include <vector>

namespace orvane
{

namespace
{

std::optional<ucred> credentialsOf(int socket)
{
    ucred peer{};
    socklen_t length = sizeof peer;
    if (::getsockopt(socket, SOL_SOCKET, SO_PEERCRED, &peer, &length) == 0)
        return peer;
    logError("The process at the other end of a connection is unknown (%s); it is refused\n",
             errorText(errno).c_str());
    return std::nullopt;
}

// The peer's supplementary groups; none where they cannot be read.
std::vector<gid_t> groupsOf(int socket)
{
    std::vector<gid_t> groups(64);
    for (;;) {
        auto length = static_cast<socklen_t>(groups.size() * sizeof(gid_t));
        const int result = ::getsockopt(socket, SOL_SOCKET, SO_PEERGROUPS, groups.data(), &length);
        const std::size_t count = length / sizeof(gid_t);
        if (result != 0 && (errno != ERANGE || count <= groups.size()))
            return {};
        groups.resize(count);
        if (result == 0)
            return groups;
    }
}

bool isTrusted(int socket, const ucred& peer, const PortsDirectory& directory)
{
    if (directory.accepts(peer.uid, peer.gid))
        return true;
    const std::vector<gid_t> groups = groupsOf(socket);
    if (std::any_of(groups.begin(), groups.end(),
                    [&](gid_t group) { return directory.acceptsGroup(group); }))
        return true;
    logError("A connection with a process of user %u is refused\n", peer.uid);
    return false;
}

} // namespace

bool isPeerTrusted(int socket, const PortsDirectory& directory)
{
    const auto peer = credentialsOf(socket);
    return peer && isTrusted(socket, *peer, directory);
}

bool isListenerTrusted(int socket, const PortsDirectory& directory, const std::string& port)
{
    const auto peer = credentialsOf(socket);
    if (!peer || !isTrusted(socket, *peer, directory))
        return false;
    if (!directory.isShared() || port != kTelephonyServerPort || peer->uid == directory.owner())
        return true;
    logError("A telephony server of user %u is refused\n", peer->uid);
    return false;
}

} // namespace orvane
