#include "platform/ports/MessagePorts.h"

#include "platform/services/SystemLog.h"

namespace orvane
{

MessagePorts::MessagePorts(FrameTransport& transport, MainQueue& mainQueue)
    : _transport(transport), _mainQueue(mainQueue)
{
}

std::unique_ptr<LocalMessagePort>
MessagePorts::createLocal(const std::string& name, LocalMessagePort::ReceiveCallback callback)
{
    std::string error = "a name has 1 to 64 letters, digits, '.', '-' and '_'";
    auto listener = isUsablePortName(name) ? _transport.listen(name, error) : nullptr;
    if (!listener) {
        logError("Could not create the port \"%s\": %s", name.c_str(), error.c_str());
        return nullptr;
    }
    auto port =
        std::make_unique<LocalMessagePort>(std::move(listener), std::move(callback), _mainQueue);
    std::erase_if(_localPorts, [](const auto& entry) { return entry.second.expired(); });
    _localPorts[name] = port->kept();
    return port;
}

std::unique_ptr<RemoteMessagePort> MessagePorts::createRemote(const std::string& name)
{
    std::string error;
    auto connection = isUsablePortName(name) ? _transport.connect(name, error) : nullptr;
    if (!connection)
        return nullptr;
    return std::make_unique<RemoteMessagePort>(std::move(connection), _mainQueue);
}

bool MessagePorts::keepWhileValid(const std::string& localPortName, std::shared_ptr<void> object)
{
    const auto found = _localPorts.find(localPortName);
    const auto kept = found == _localPorts.end() ? nullptr : found->second.lock();
    if (!kept)
        return false;
    kept->push_back(std::move(object));
    return true;
}

} // namespace orvane
