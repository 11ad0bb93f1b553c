#pragma once

#include "platform/linux/FileDescriptor.h"
#include "platform/linux/PortsDirectory.h"

#include <optional>
#include <string>
#include <sys/types.h>

namespace orvane
{

// A listening socket and its file DIRECTORY/NAME. The destructor removes the file, unless another
// file has taken its place.
//
// A name appears in one step: the socket is bound and listening under a temporary name, which is
// then renamed without replacing anything. Nobody locks anything. Of several programs that find the
// same stale file, one moves it aside to a name made of its inode number. That name stays taken for
// a minute, so that no other program can move aside what has replaced the stale file.
class PortSocket
{
public:
    // Takes over the name from a stale socket: the effective user's own, or in a directory of the
    // effective user anybody's. The name "TelephonyServer" of a shared directory belongs to the
    // directory's owner, who takes it from whoever else has it.
    //
    // Returns nullopt, with the reason in `error`, when the path is too long, when a live socket or
    // something that is not a socket has the name, or when it is somebody else's.
    static std::optional<PortSocket> claim(const PortsDirectory& directory, const std::string& name,
                                           std::string& error);
    ~PortSocket();
    PortSocket(PortSocket&& other) noexcept = default;
    PortSocket& operator=(PortSocket&&) = delete;

    [[nodiscard]] int descriptor() const { return _socket.get(); }

private:
    PortSocket(std::string path, FileDescriptor socket);

    std::string _path;
    FileDescriptor _socket;
    dev_t _device = 0; // with _inode, tells the socket's file from another file of the name
    ino_t _inode = 0;
};

} // namespace orvane
