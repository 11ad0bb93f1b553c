#pragma once

#include "platform/linux/SocketTransport.h"

#include <optional>
#include <string>

namespace orvane
{

// The transport of a viewer whose user has not named a ports directory. It uses the user's own
// directory, unless a telephony server accepts in the system's directory and none in the own.
//
// It looks each time when a port is to be listened on, as at the start of each attempt to connect,
// so that a server that starts later is found.
class ServerSearch final : public FrameTransport
{
public:
    // Both directories as PortsDirectory has them; `sharedOwner` as in PortsDirectory::existing().
    ServerSearch(PortsDirectory own, std::string systemPath, std::optional<uid_t> sharedOwner);

    std::unique_ptr<FrameListener> listen(const std::string& name, std::string& error) override;
    std::unique_ptr<FrameConnection> connect(const std::string& name, std::string& error) override;

private:
    void choose();

    SocketTransport _own;
    std::string _systemPath;
    std::optional<uid_t> _sharedOwner;
    std::optional<SocketTransport> _system; // while it is the chosen one
};

} // namespace orvane
