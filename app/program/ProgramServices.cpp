#include "app/program/ProgramServices.h"

#include "platform/linux/ResourceDirectory.h"
#include "platform/services/Services.h"

namespace orvane
{

ProgramServices::ProgramServices(SystemLog* log, std::FILE* console)
    : _console(console),
      _resourceDirectory(resourceDirectory(ORVANE_SHARE, ORVANE_SOURCE_RESOURCES)),
      _resources(_resourceDirectory)
{
    if (_resources.pathsOfType("plist").empty())
        _problem = "there are no display templates in \"" + _resourceDirectory +
                   "\": install orvane again, or run it from the directory that it was built in";
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
