#include "platform/services/CommonOptions.h"

#include "platform/base/Technology.h"

namespace orvane
{

std::unique_ptr<SystemLog> makeLog(const LogChoice& choice, const char* programName)
{
    switch (choice.target) {
    case LogChoice::Target::StandardError:
        return std::make_unique<StandardErrorLog>(choice.lowest);
    case LogChoice::Target::None:
        return std::make_unique<NullLog>();
    case LogChoice::Target::Syslog:
        break;
    }
    return std::make_unique<SyslogLog>(programName, choice.lowest);
}

ValueNames commonValueNames(std::span<const std::string> scenarios)
{
    ValueNames names{
        {"SCENARIO", {scenarios.begin(), scenarios.end()}  },
        {"PRIORITY", {"error", "warning", "notice", "info"}},
    };
    for (const Technology& technology : kTechnologies)
        names["NAME"].emplace_back(technology.name);
    return names;
}

} // namespace orvane
