#include "platform/services/LogOption.h"

namespace orvane
{

std::unique_ptr<SystemLog> logFromOptions(CommandLine& line, const char* programName)
{
    const std::string level = line.value(kLogLevelOption).value_or("warning");
    const std::optional<LogPriority> lowest = logPriorityNamed(level);
    if (!lowest) {
        line.fail("--log-level takes error, warning, notice or info, not \"" + level + "\"");
        return nullptr;
    }
    const std::string log = line.value(kLogOption).value_or("syslog");
    if (log == "syslog")
        return std::make_unique<SyslogLog>(programName, *lowest);
    if (log == "stderr")
        return std::make_unique<StandardErrorLog>(*lowest);
    if (log == "none")
        return std::make_unique<NullLog>();
    line.fail("--log takes syslog, stderr or none, not \"" + log + "\"");
    return nullptr;
}

} // namespace orvane
