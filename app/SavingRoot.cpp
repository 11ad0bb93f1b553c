#include "app/SavingRoot.h"

#include "app/LiveApp.h"
#include "platform/services/SystemLog.h"

#include <cstdlib>
#include <filesystem>
#include <stdexcept>

namespace orvane
{

namespace
{

std::filesystem::path stateDirectory()
{
    const char* state = std::getenv("XDG_STATE_HOME");
    if (state && state[0] == '/')
        return state;
    const char* home = std::getenv("HOME");
    if (home && *home)
        return std::filesystem::path(home) / ".local/state";
    throw std::runtime_error("there is no home directory for saved files: set HOME or "
                             "XDG_STATE_HOME, or give --root DIR");
}

// Throws std::runtime_error with a line for the user.
std::string stateRoot(const char* name)
{
    const std::filesystem::path parent = stateDirectory() / "orvane";
    const std::string root = (parent / name).string();
    std::error_code problem;
    std::filesystem::create_directories(parent, problem);
    if (!problem)
        problem = FileSystem(parent.string()).makeOwnFolder("/" + std::string(name));
    for (const char* folder : {kInstallMarker, kLogFolder})
        if (!problem)
            problem = FileSystem(root).makeOwnFolder(folder);
    if (problem)
        throw std::runtime_error("saved files cannot be kept in " + root + " (" +
                                 problem.message() + "): set XDG_STATE_HOME, or give --root DIR");
    return root;
}

} // namespace

std::string liveRoot(const std::string& machine)
{
    if (FileSystem(machine).exists(kInstallMarker))
        return machine;
    try {
        return stateRoot("root");
    } catch (const std::runtime_error& failure) {
        logWarning("%s", failure.what());
        return machine;
    }
}

std::string simulatedPhoneRoot() { return stateRoot("demo"); }

} // namespace orvane
