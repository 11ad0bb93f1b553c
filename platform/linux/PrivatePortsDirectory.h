#pragma once

#include "platform/linux/PortsDirectory.h"

#include <ctime>
#include <string>

namespace orvane
{

// A new ports directory that nobody else knows of, in $XDG_RUNTIME_DIR or else in /tmp, whose paths
// are short enough for sockets. The destructor removes it and everything in it.
class PrivatePortsDirectory
{
public:
    // Throws std::system_error when none can be made.
    PrivatePortsDirectory();
    ~PrivatePortsDirectory();
    PrivatePortsDirectory(const PrivatePortsDirectory&) = delete;
    PrivatePortsDirectory& operator=(const PrivatePortsDirectory&) = delete;

    [[nodiscard]] const std::string& path() const { return _directory.path(); }
    [[nodiscard]] const PortsDirectory& directory() const { return _directory; }

    // Removes the private directories that killed programs of the effective user have left: those
    // that hold nothing but sockets on which nobody accepts, among them a telephony server's, or
    // that are older than a minute. `now` is in seconds since 1970.
    static void removeAbandoned(std::time_t now);

private:
    PortsDirectory _directory;
};

} // namespace orvane
