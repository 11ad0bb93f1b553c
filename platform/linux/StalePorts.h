#pragma once

#include "platform/linux/PortsDirectory.h"

#include <ctime>
#include <string>

namespace orvane
{

// What killed programs leave in a ports directory.

// Begins the names of files that are not ports: sockets before their publication, and stale ones
// that were moved aside.
inline constexpr char kUnpublishedPrefix = '~';

// Something younger may belong to a program that is about to use it.
inline constexpr std::time_t kYoungSeconds = 60;

// Whether the path is a socket that nobody accepts connections on.
bool isStaleSocket(const std::string& path);

enum class StalePorts {
    Clients, // ports that viewers have made
    All,     // also the channels' ports; only the running telephony server may remove them
};

// Removes stale sockets: the effective user's own, or in a directory of his everybody's; and
// unpublished files older than a minute. Leaves the name "TelephonyServer", which a new server
// takes over, and everything that is not a socket. `now` is in seconds since 1970.
void removeStalePorts(const PortsDirectory& directory, StalePorts which, std::time_t now);

} // namespace orvane
