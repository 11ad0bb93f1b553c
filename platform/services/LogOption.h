#pragma once

#include "platform/base/CommandLine.h"
#include "platform/services/SystemLog.h"

#include <memory>
#include <optional>
#include <string_view>

namespace orvane
{

// The options --log and --log-level, which every program has.

inline constexpr std::string_view kLogOption = "log";
inline constexpr std::string_view kLogLevelOption = "log-level";

// What the help says of the two.
inline constexpr const char* kLogOptionsHelp =
    "  --log syslog|stderr|none  where log lines go (default syslog)\n"
    "  --log-level PRIORITY      the lowest priority passed on: error, warning, notice or info\n"
    "                            (default warning)\n";

// The log that the options name. Null, with the line's error set, when they name none.
// `programName` must outlive the log.
std::unique_ptr<SystemLog> logFromOptions(CommandLine& line, const char* programName);

} // namespace orvane
