#include "app/program/SimulatedPhone.h"

#include "app/LiveApp.h"
#include "platform/linux/SocketTransport.h"
#include "platform/services/FileSystem.h"
#include "telephonyd/LogServer.h"
#include "telephonyd/phone/Scenarios.h"
#include "ui/SnapshotFile.h"

#include <cstdlib>
#include <filesystem>
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

std::filesystem::path stateDirectory()
{
    const char* state = std::getenv("XDG_STATE_HOME");
    if (state && state[0] == '/')
        return state;
    const char* home = std::getenv("HOME");
    if (home && *home)
        return std::filesystem::path(home) / ".local/state";
    throw std::runtime_error("there is no home directory for the simulated phone's files: set HOME "
                             "or XDG_STATE_HOME, or give --root DIR");
}

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

std::string simulatedPhoneRoot()
{
    const std::filesystem::path root = stateDirectory() / "orvane/demo";
    const FileSystem files(root.string());
    std::error_code error;
    for (const char* folder : {kInstallMarker, kLogFolder})
        if (!std::filesystem::create_directories(files.located(folder), error) && error)
            throw std::runtime_error("the simulated phone's files cannot be kept in " +
                                     root.string() + " (" + error.message() +
                                     "): set XDG_STATE_HOME, or give --root DIR");
    return root.string();
}

} // namespace orvane
