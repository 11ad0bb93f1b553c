#pragma once

#include "platform/services/Console.h"
#include "platform/services/Resources.h"

#include <optional>
#include <string>

namespace orvane
{

class SystemLog;

// Sets the process-wide services of the program while the object exists.
class ProgramServices
{
public:
    // The log may be null. `console` takes the lines for the user at the console.
    ProgramServices(SystemLog* log, std::FILE* console);
    ~ProgramServices();
    // One line that says that the resources are missing, and where they were looked for.
    [[nodiscard]] const std::optional<std::string>& problem() const { return _problem; }
    ProgramServices(const ProgramServices&) = delete;
    ProgramServices& operator=(const ProgramServices&) = delete;

private:
    StreamConsole _console;
    std::string _resourceDirectory;
    DirectoryResources _resources;
    std::optional<std::string> _problem;
};

} // namespace orvane
