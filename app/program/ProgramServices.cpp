#include "app/program/ProgramServices.h"

#include "platform/linux/ResourceDirectory.h"
#include "platform/services/Services.h"

namespace orvane
{

ProgramServices::ProgramServices(SystemLog* log, std::FILE* console)
    : _console(console), _resources(resourceDirectory(ORVANE_SHARE, ORVANE_SOURCE_RESOURCES))
{
    Services& services = Services::current();
    services.setLog(log);
    services.setConsole(&_console);
    services.setResources(&_resources);
    services.setVersion(ORVANE_VERSION);
}

ProgramServices::~ProgramServices()
{
    Services& services = Services::current();
    services.setLog(nullptr);
    services.setConsole(nullptr);
    services.setResources(nullptr);
}

} // namespace orvane
