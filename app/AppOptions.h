#pragma once

#include "platform/services/CommonOptions.h"

#include <chrono>
#include <optional>
#include <span>
#include <string>
#include <vector>

namespace orvane
{

// In the order of the program's tables.
enum class AppCommand { Live, Open, Export };
enum class FrontEndKind { Window, Terminal, Text, Json };
enum class ExportFormat { Csv, JsonLines, PathList };

// What the command line asks `orvane` for.
struct AppOptions {
    AppCommand command = AppCommand::Live;
    bool wantsHelp = false; // on the command
    bool wantsVersion = false;
    LogChoice log;

    // Of the live view and of a recording that is opened.
    std::optional<FrontEndKind> frontEnd;
    bool isFullScreen = false;
    bool printsDetails = false; // numbers, units and times, with json
    // Also what --every of an export asks for.
    std::chrono::nanoseconds refreshInterval = std::chrono::seconds(2);

    // Of the live view.
    std::optional<std::string> demo; // the scenario of a simulated phone
    // Print the first display that has rows and end; give up after that time.
    std::optional<std::chrono::nanoseconds> once;
    std::string ports; // empty where not given
    std::optional<std::string> root;
    std::optional<std::string> record; // the file to record to
    bool overwritesRecord = false;     // even if it already exists

    // Of a recording that is opened or exported.
    std::string file;
    std::optional<std::string> technology; // its technology constant
    ExportFormat format = ExportFormat::JsonLines;
    bool isForSpreadsheet = false; // of CSV: no cell is taken for a formula
    bool listsPaths = false;
    std::vector<std::string> paths; // none: every row

    // One line that says what is wrong and what to do; then nothing else counts.
    std::optional<std::string> error;
};

// `arguments` are those after the program's name; `scenarios` are the simulated phones, the default
// first.
AppOptions parseAppOptions(std::span<const std::string> arguments,
                           std::span<const std::string> scenarios);

// The front end where none is asked for.
FrontEndKind defaultFrontEnd(bool hasDisplay, bool hasTerminal);

// The text of --help on that command.
std::string appHelp(AppCommand command, std::span<const std::string> scenarios);

} // namespace orvane
