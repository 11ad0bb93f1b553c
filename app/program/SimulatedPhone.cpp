#include "app/program/SimulatedPhone.h"

#include "platform/linux/SocketTransport.h"
#include "telephonyd/LogServer.h"
#include "telephonyd/phone/Scenarios.h"

#include <stdexcept>

namespace orvane
{

namespace
{

struct Parts {
    Parts(const PortsDirectory& directory, MainQueue& queue, const std::string& scenario)
        : transport(directory), server(transport, queue, phoneSourceFactory(scenario, queue))
    {
    }
    SocketTransport transport;
    LogServer server;
};

} // namespace

SimulatedPhone::SimulatedPhone(const PortsDirectory& directory, const std::string& scenario)
    : _thread([directory, scenario](MainQueue& queue) -> std::shared_ptr<void> {
          auto parts = std::make_shared<Parts>(directory, queue, scenario);
          if (const auto error = parts->server.start())
              throw std::runtime_error(*error);
          return parts;
      })
{
}

} // namespace orvane
