#pragma once

#include "platform/services/SystemLog.h"

#include <chrono>
#include <memory>
#include <optional>
#include <span>
#include <string>

namespace orvane
{

enum class FrontEndKind { Window, Terminal, Text, Json };

// What the command line asks `orvane` for.
struct AppOptions {
    bool wantsHelp = false;
    bool wantsVersion = false;
    std::optional<std::string> demo;      // the scenario of a simulated phone
    std::optional<FrontEndKind> frontEnd; // nothing where not given
    bool isFullScreen = false;
    std::string ports;               // empty where not given
    std::optional<std::string> root; // nothing where not given
    std::chrono::nanoseconds refreshInterval = std::chrono::seconds(2);
    std::optional<std::string> open;       // a recording, instead of the live view
    std::optional<std::string> technology; // its technology constant; nothing where not given
    std::optional<std::string> record;     // the file to record to
    bool overwritesRecord = false;         // also where it is there already
    std::unique_ptr<SystemLog> log;

    // One line that says what is wrong and what to do; then nothing else counts.
    std::optional<std::string> error;
};

// `arguments` are those after the program's name; `scenarios` the simulated phones that there are.
AppOptions parseAppOptions(std::span<const std::string> arguments,
                           std::span<const std::string> scenarios);

// The front end where none is asked for.
FrontEndKind defaultFrontEnd(bool hasDisplay, bool hasTerminal);

// The text of --help.
std::string appHelp(std::span<const std::string> scenarios);

} // namespace orvane
