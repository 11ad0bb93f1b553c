#pragma once

#include "platform/ports/FrameConnection.h"
#include "platform/ports/LocalMessagePort.h"
#include "platform/ports/RemoteMessagePort.h"

#include <map>
#include <memory>
#include <string>

namespace orvane
{

// Makes message ports over a frame transport. Transport and queue must outlive the ports; the ports
// may outlive this.
class MessagePorts
{
public:
    // Invalidation callbacks come on `mainQueue`.
    MessagePorts(FrameTransport& transport, MainQueue& mainQueue);

    // Returns null, with an error line, when the name is unusable or a live port has it.
    std::unique_ptr<LocalMessagePort> createLocal(const std::string& name,
                                                  LocalMessagePort::ReceiveCallback callback);
    // Returns null when nothing answers to the name.
    std::unique_ptr<RemoteMessagePort> createRemote(const std::string& name);

    // Holds the object until the local port of that name, made here, is invalidated or destroyed.
    // Returns false, holding nothing, when there is no such port or it is invalid.
    bool keepWhileValid(const std::string& localPortName, std::shared_ptr<void> object);

private:
    FrameTransport& _transport;
    MainQueue& _mainQueue;
    std::map<std::string, std::weak_ptr<LocalMessagePort::Kept>> _localPorts;
};

} // namespace orvane
