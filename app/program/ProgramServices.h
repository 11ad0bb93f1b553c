#pragma once

#include "platform/Console.h"
#include "platform/Resources.h"

namespace orvane
{

class SystemLog;

// The process-wide services of the program, for as long as it lives.
class ProgramServices
{
public:
    // The log may be null.
    explicit ProgramServices(SystemLog* log);
    ~ProgramServices();
    ProgramServices(const ProgramServices&) = delete;
    ProgramServices& operator=(const ProgramServices&) = delete;

private:
    StandardErrorConsole _console;
    DirectoryResources _resources;
};

} // namespace orvane
