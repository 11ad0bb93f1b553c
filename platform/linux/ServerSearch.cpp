#include "platform/linux/ServerSearch.h"

#include "platform/base/TelephonyConstants.h"
#include "platform/linux/StalePorts.h"

#include <ctime>
#include <utility>

namespace orvane
{

ServerSearch::ServerSearch(PortsDirectory own, std::string systemPath,
                           std::optional<uid_t> sharedOwner)
    : _own(std::move(own)), _systemPath(std::move(systemPath)), _sharedOwner(sharedOwner)
{
}

void ServerSearch::choose()
{
    const bool wasSystem = _system.has_value();
    _system.reset();
    if (_own.hasListener(kTelephonyServerPort))
        return;
    std::string ignored; // most machines have no such directory
    const auto directory = PortsDirectory::existing(_systemPath, ignored, _sharedOwner);
    if (!directory)
        return;
    SocketTransport transport(*directory);
    if (!transport.hasListener(kTelephonyServerPort))
        return;
    if (!wasSystem)
        removeStalePorts(*directory, StalePorts::Clients, std::time(nullptr));
    _system.emplace(std::move(transport));
}

std::unique_ptr<FrameListener> ServerSearch::listen(const std::string& name, std::string& error)
{
    choose();
    return (_system ? *_system : _own).listen(name, error);
}

std::unique_ptr<FrameConnection> ServerSearch::connect(const std::string& name, std::string& error)
{
    return (_system ? *_system : _own).connect(name, error);
}

} // namespace orvane
