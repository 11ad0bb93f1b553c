#pragma once

#include "platform/linux/PortsDirectory.h"
#include "platform/ports/FrameConnection.h"

#include <string>

namespace orvane
{

// Frames over Unix stream sockets DIRECTORY/NAME, driven by the event loop of the thread that
// listens or connects. Only peers that the directory accepts are served.
//
// Connections and listeners may outlive the transport. A connection without a frame callback holds
// the first frames that arrive; the peer keeps the rest. A frame that announces more than
// kFrameDataLimit bytes ends its connection, with a line in the log.
class SocketTransport final : public FrameTransport
{
public:
    explicit SocketTransport(PortsDirectory directory) : _directory(std::move(directory)) {}

    // Whether a process that can be trusted accepts connections on the name.
    [[nodiscard]] bool hasListener(const std::string& name) const;
    std::unique_ptr<FrameListener> listen(const std::string& name, std::string& error) override;
    std::unique_ptr<FrameConnection> connect(const std::string& name, std::string& error) override;

private:
    PortsDirectory _directory;
};

} // namespace orvane
