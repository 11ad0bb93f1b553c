#pragma once

#include "platform/ports/FrameConnection.h"

#include <string>

namespace orvane
{

// Frames over Unix stream sockets DIRECTORY/NAME, driven by the event loop of the thread that
// listens or connects. Only peers of the same effective user, or root, are served.
//
// Connections and listeners may outlive the transport. Frames that arrive while a connection has no
// frame callback wait in it, a few of them; the peer waits with the rest. A frame that announces
// more than kFrameDataLimit bytes ends its connection, with a line in the log.
class SocketTransport final : public FrameTransport
{
public:
    // The directory must be one that PortsDirectory (or PrivatePortsDirectory) has passed.
    explicit SocketTransport(std::string directory) : _directory(std::move(directory)) {}

    std::unique_ptr<FrameListener> listen(const std::string& name, std::string& error) override;
    std::unique_ptr<FrameConnection> connect(const std::string& name, std::string& error) override;

private:
    std::string _directory;
};

} // namespace orvane
