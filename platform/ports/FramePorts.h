#pragma once

#include "platform/ports/FrameConnection.h"
#include "platform/ports/FrameLocalPort.h"
#include "platform/ports/MessagePort.h"

#include <memory>
#include <string>
#include <vector>

namespace orvane
{

// Message ports over a frame transport. Transport and queue must outlive the ports; the ports may
// outlive this.
class FramePorts final : public MessagePorts
{
public:
    // Invalidation callbacks come on `mainQueue`.
    FramePorts(FrameTransport& transport, MainQueue& mainQueue);

    std::unique_ptr<LocalMessagePort>
    createLocal(const std::string& name, LocalMessagePort::ReceiveCallback callback) override;
    std::unique_ptr<RemoteMessagePort> createRemote(const std::string& name) override;

    // Holds the object until the local port of that name, made here, is invalidated or destroyed.
    // False, holding nothing, when there is no such port or it is invalid.
    bool keepWhileValid(const std::string& localPortName, std::shared_ptr<void> object);

private:
    FrameTransport& _transport;
    MainQueue& _mainQueue;
    std::vector<std::weak_ptr<FrameLocalPort::Lifetime>> _localPorts;
};

} // namespace orvane
