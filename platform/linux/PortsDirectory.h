#pragma once

#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

// The directory in which named ports live: private to its user.
class PortsDirectory
{
public:
    // The directory `option` (the value of --ports; empty = not given), else $ORVANE_PORTS, else
    // $XDG_RUNTIME_DIR/telephony, else /tmp/telephony-UID; created with mode 0700 where missing,
    // for the first two with its parents. An empty variable counts as not set, and so does an
    // $XDG_RUNTIME_DIR that is not absolute.
    //
    // Nothing, with one line in `error` that says what to do, when it cannot be had, is not a
    // directory, belongs to somebody else, can be written by group or others, or is a symbolic link
    // of somebody else's.
    static std::optional<PortsDirectory> open(std::string_view option, std::string& error);

    [[nodiscard]] const std::string& path() const { return _path; }

private:
    explicit PortsDirectory(std::string path) : _path(std::move(path)) {}
    std::string _path;
};

// A new ports directory that nobody else knows of, in $XDG_RUNTIME_DIR or else in /tmp, whose paths
// are short enough for sockets. Removed, with what is left in it, at the end.
class PrivatePortsDirectory
{
public:
    // Throws std::system_error when none can be made.
    PrivatePortsDirectory();
    ~PrivatePortsDirectory();
    PrivatePortsDirectory(const PrivatePortsDirectory&) = delete;
    PrivatePortsDirectory& operator=(const PrivatePortsDirectory&) = delete;

    [[nodiscard]] const std::string& path() const { return _path; }

private:
    std::string _path;
};

} // namespace orvane
