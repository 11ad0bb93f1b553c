#pragma once

#include "platform/services/Console.h"
#include "platform/services/Resources.h"

namespace orvane
{

class SystemLog;

// The process-wide services of the program, for as long as it lives.
class ProgramServices
{
public:
    // The log may be null. Lines for a person at the console go to that stream.
    ProgramServices(SystemLog* log, std::FILE* console);
    ~ProgramServices();
    ProgramServices(const ProgramServices&) = delete;
    ProgramServices& operator=(const ProgramServices&) = delete;

private:
    StreamConsole _console;
    DirectoryResources _resources;
};

} // namespace orvane
