#pragma once

#include "platform/services/CommonOptions.h"

#include <optional>
#include <span>
#include <string>

namespace orvane
{

// What the command line asks `telephonyd` for.
struct DaemonOptions {
    bool wantsHelp = false;
    bool wantsVersion = false;
    LogChoice log;

    // One of them is given, or both modem and port.
    std::optional<std::string> demo;     // the scenario of a simulated phone
    std::optional<std::string> replay;   // the recording that is sent again
    std::optional<std::string> messages; // the technology constant of the messages that are typed
    std::optional<std::string> port;     // the device that is a modem's diagnostic port
    std::optional<std::string> modem;    // the ID of a modem; empty = the only one there is
    bool listsModems = false;

    // Of a modem, or of the list of them.
    bool usesSessionBus = false;
    bool listsAsJson = false;

    // Of a recording or a modem.
    std::optional<std::string> technology; // the constant; nothing = by the log codes that come

    // Of a recording.
    std::optional<double> speed = 1.0; // nothing = as fast as clients take it
    bool loops = false;

    std::string ports; // empty where not given

    // One line that says what is wrong and what to do; then nothing else counts.
    std::optional<std::string> error;
};

// `arguments` are those after the program's name; `scenarios` are the simulated phones, the default
// first.
DaemonOptions parseDaemonOptions(std::span<const std::string> arguments,
                                 std::span<const std::string> scenarios);

// The text of --help.
std::string daemonHelp(std::span<const std::string> scenarios);

} // namespace orvane
