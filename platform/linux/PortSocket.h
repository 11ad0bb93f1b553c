#pragma once

#include "platform/linux/FileDescriptor.h"

#include <optional>
#include <string>
#include <sys/types.h>

namespace orvane
{

// A listening socket and its file DIRECTORY/NAME. The end removes the file, unless somebody has put
// another in its place.
//
// Whoever claims or removes a name holds a lock on the directory meanwhile, so that of two programs
// that find the same stale file only one replaces it, and neither removes the other's new one.
class PortSocket
{
public:
    // Takes over a stale name. Nothing, with the reason in `error`, when the path is too long, a
    // live listener has the name or something that is no socket is there.
    static std::optional<PortSocket> claim(const std::string& directory, const std::string& name,
                                           std::string& error);
    ~PortSocket();
    PortSocket(PortSocket&& other) noexcept = default;
    PortSocket& operator=(PortSocket&&) = delete;

    [[nodiscard]] int descriptor() const { return _socket.get(); }

private:
    PortSocket(std::string directory, std::string path, FileDescriptor socket);

    std::string _directory;
    std::string _path;
    FileDescriptor _socket;
    dev_t _device = 0; // these two tell its file from another of the name
    ino_t _inode = 0;
};

} // namespace orvane
