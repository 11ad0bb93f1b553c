#include "platform/ports/FramePorts.h"

#include "platform/ports/FrameRemotePort.h"
#include "platform/services/SystemLog.h"

namespace orvane
{

FramePorts::FramePorts(FrameTransport& transport, MainQueue& mainQueue)
    : _transport(transport), _mainQueue(mainQueue)
{
}

std::unique_ptr<LocalMessagePort>
FramePorts::createLocal(const std::string& name, LocalMessagePort::ReceiveCallback callback)
{
    std::string error = "a name has 1 to 64 letters, digits, '.', '-' and '_'";
    auto listener = isUsablePortName(name) ? _transport.listen(name, error) : nullptr;
    if (!listener) {
        logError("Could not create the port \"%s\": %s", name.c_str(), error.c_str());
        return nullptr;
    }
    auto port = std::make_unique<FrameLocalPort>(name, std::move(listener), std::move(callback),
                                                 _mainQueue);
    std::erase_if(_localPorts, [](const auto& lifetime) { return lifetime.expired(); });
    _localPorts.push_back(port->lifetime());
    return port;
}

std::unique_ptr<RemoteMessagePort> FramePorts::createRemote(const std::string& name)
{
    std::string error;
    auto connection = isUsablePortName(name) ? _transport.connect(name, error) : nullptr;
    if (!connection)
        return nullptr;
    return std::make_unique<FrameRemotePort>(std::move(connection), _mainQueue);
}

bool FramePorts::keepWhileValid(const std::string& localPortName, std::shared_ptr<void> object)
{
    for (const auto& weak : _localPorts) {
        const auto lifetime = weak.lock();
        if (lifetime && lifetime->valid && lifetime->portName == localPortName) {
            lifetime->kept.push_back(std::move(object));
            return true;
        }
    }
    return false;
}

} // namespace orvane
