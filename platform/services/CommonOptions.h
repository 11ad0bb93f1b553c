#pragma once

#include "platform/base/CommandLine.h"
#include "platform/services/SystemLog.h"

#include <memory>

namespace orvane
{

// Options that every program has.

// What --log and --log-level ask for.
struct LogChoice {
    enum class Target { Syslog, StandardError, None }; // in the order of the option's values
    Target target = Target::Syslog;
    LogPriority lowest = LogPriority::Warning;
};

// `programName` must outlive the log.
std::unique_ptr<SystemLog> makeLog(const LogChoice& choice, const char* programName);

// Rows of a table of options, for the members `log`, `wantsHelp` and `wantsVersion`.
template <typename Options>
inline constexpr Option<Options>
    kLogOption({"log", "syslog|stderr|none", "where log lines go (default syslog)"},
               [](Options& options, const GivenOption& given) {
                   options.log.target = static_cast<LogChoice::Target>(given.choice());
               });
template <typename Options>
inline constexpr Option<Options> kLogLevelOption(
    {"log-level", "PRIORITY", "the lowest priority passed on: {} (default warning)"},
    [](Options& options, const GivenOption& given) {
        options.log.lowest = *logPriorityNamed(given.text());
    });
template <typename Options>
inline constexpr Option<Options> kHelpOption({"help", "", "show this"}, &Options::wantsHelp);
template <typename Options>
inline constexpr Option<Options> kVersionOption({"version", "", "show the version"},
                                                &Options::wantsVersion);

// The values of SCENARIO, NAME (of a technology) and PRIORITY.
ValueNames commonValueNames(std::span<const std::string> scenarios);

} // namespace orvane
