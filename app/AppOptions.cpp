#include "app/AppOptions.h"

#include "platform/base/CommandHelp.h"
#include "platform/base/Technology.h"

#include <algorithm>

namespace orvane
{

namespace
{

constexpr std::string_view kLiveAbout = R"(
Shows what the modem knows about the radio network, from this machine's telephony server or from
FILE, a recorded diagnostic log (.dlf) or a saved snapshot (.orvane); "-" is standard input.)";

constexpr std::string_view kLiveNotes = R"(
With text and json, lines on standard input are commands: "save DESCRIPTION" saves a snapshot where
saving is offered, "quit" ends the program.)";

constexpr std::string_view kExportAbout = R"(
Writes rows of a recording to standard output, one line for each refresh period.

FILE is a diagnostic log (.dlf) or a saved snapshot (.orvane), which gives a line for each of its
entries; "-" is standard input. A PATH is that of a row, as in "/Serving Cell Info/Cell Identity",
or of a group for all its rows; * stands for any name, such as that of a list element. Without a
PATH, every row is written.)";

constexpr CommandLineCommand kCommands[] = {
    {"",       "[FILE] [OPTION...]",                kLiveAbout,   kLiveNotes},
    {"open",   "open FILE [OPTION...]",             "",           ""        },
    {"export", "export FILE [OPTION...] [PATH...]", kExportAbout, ""        },
};

constexpr unsigned bit(AppCommand command) { return 1U << static_cast<unsigned>(command); }

constexpr CommandSet kLive{bit(AppCommand::Live),
                           "is for the live view: a recording is read without it"};
constexpr CommandSet kScreens{bit(AppCommand::Live) | bit(AppCommand::Open),
                              "is for the live view and orvane open: leave it out"};
constexpr CommandSet kRecordings{bit(AppCommand::Open) | bit(AppCommand::Export),
                                 "is for recordings: orvane open FILE --technology NAME"};
constexpr CommandSet kExport{bit(AppCommand::Export),
                             "is for recordings that are exported: orvane export FILE"};

using AppOption = Option<AppOptions>;

constexpr AppOption kOptions[] = {
    AppOption(
        {"demo", "[SCENARIO]", "attach to a simulated phone: {} (default lte)", kLive},
        [](AppOptions& options, const GivenOption& given) { options.demo = given.textOrFirst(); }),
    AppOption(
        {"ui", "window|terminal|text|json",
         "how to show it (default: a window where there is a display, else the terminal where "
         "standard output is one, else text)",
         kScreens},
        [](AppOptions& options, const GivenOption& given) {
            options.frontEnd = static_cast<FrontEndKind>(given.choice());
        }),
    AppOption({"fullscreen", "", "let the window fill the screen", kScreens},
              &AppOptions::isFullScreen),
    AppOption(
        {"details", "", "with json: print the numbers, units and times of rows too", kScreens},
        &AppOptions::printsDetails),
    AppOption({"ports", "DIR",
               "where the telephony server's ports are (default $ORVANE_PORTS, else the first of "
               "$XDG_RUNTIME_DIR/telephony and /run/telephonyd in which a server accepts)",
               kLive},
              &AppOptions::ports),
    AppOption({"root", "DIR",
               "take the log folder and the install marker below DIR (default / where the marker "
               "is, else $XDG_STATE_HOME/orvane/root)",
               kLive},
              &AppOptions::root),
    AppOption({"refresh", "SECONDS", "the refresh period (default 2.0)", kScreens, 0.01, 86400},
              &AppOptions::refreshInterval),
    AppOption(
        {"format", "csv|jsonl",
         "csv with a header and a column for each row, or one JSON object on each line (default "
         "csv with a PATH, else jsonl)",
         kExport},
        [](AppOptions& options, const GivenOption& given) {
            options.format = static_cast<ExportFormat>(given.choice());
        }),
    AppOption({"every", "SECONDS", "the refresh period (default 2.0)", kExport, 0.001, 86400},
              &AppOptions::refreshInterval),
    AppOption(
        {"spreadsheet", "",
         "with csv: put an apostrophe before cells that a spreadsheet would take for formulas",
         kExport},
        &AppOptions::isForSpreadsheet),
    AppOption({"list", "", "print the paths that occur", kExport}, &AppOptions::listsPaths),
    AppOption(
        {"once", "[SECONDS]",
         "with text and json: print the first display that has rows and end, or fail if none comes "
         "within SECONDS (default 10)",
         kLive, 0.01, 86400},
        [](AppOptions& options, const GivenOption& given) {
            options.once = std::chrono::seconds(10);
            if (!given.value().empty())
                given.storeIn(*options.once);
        }),
    AppOption({"technology", "NAME",
               "what FILE is a recording of: {} (default: by the log codes in it)", kRecordings},
              [](AppOptions& options, const GivenOption& given) {
                  options.technology = technologyNamed(given.text());
              }),
    AppOption(
        {"record", "FILE", "write every message of the modem to FILE, a diagnostic log", kLive},
        &AppOptions::record),
    AppOption({"force", "", "overwrite FILE if it already exists", kLive},
              &AppOptions::overwritesRecord),
    kLogOption<AppOptions>,
    kLogLevelOption<AppOptions>,
    kHelpOption<AppOptions>,
    kVersionOption<AppOptions>,
};

std::vector<CommandLineOption> describedOptions()
{
    return {std::begin(kOptions), std::end(kOptions)};
}

// Whether a word is the name of a file rather than a command that was misspelt.
bool isFileName(const std::string& word)
{
    return word == "-" || word.find_first_of("./") != std::string::npos;
}

// The command that the first word names. A file's name stands for "open"; the live view has no
// word.
AppCommand commandOf(const std::vector<std::string>& words)
{
    const auto found =
        words.empty() ? std::end(kCommands)
                      : std::find_if(std::begin(kCommands), std::end(kCommands),
                                     [&](const auto& each) { return each.name == words.front(); });
    if (found != std::end(kCommands))
        return static_cast<AppCommand>(found - std::begin(kCommands));
    return !words.empty() && isFileName(words.front()) ? AppCommand::Open : AppCommand::Live;
}

void takeWords(AppOptions& options, std::vector<std::string> words,
               std::span<const std::string> scenarios)
{
    if (options.command == AppCommand::Live) {
        if (words.empty())
            return;
        const std::string& word = words.front();
        const bool isScenario =
            std::find(scenarios.begin(), scenarios.end(), word) != scenarios.end();
        throw UsageError(
            "\"" + word + "\" is not a command: " +
            (isScenario
                 ? "for the simulated phone write --demo=" + word
                 : "see orvane --help; to open a file of that name write orvane open " + word));
    }
    if (words.front() == kCommands[static_cast<std::size_t>(options.command)].name)
        words.erase(words.begin());
    if (words.empty() || words.front().empty() ||
        (options.command == AppCommand::Open && words.size() > 1))
        throw UsageError(options.command == AppCommand::Open
                             ? "open needs the name of one recording: orvane open FILE"
                             : "export needs the name of a recording: orvane export FILE "
                               "[PATH...]");
    options.file = words.front();
    options.paths.assign(words.begin() + 1, words.end());
    if (std::find(options.paths.begin(), options.paths.end(), "") != options.paths.end())
        throw UsageError("a PATH cannot be empty: see orvane export --list FILE");
}

void parse(AppOptions& options, std::span<const std::string> arguments,
           std::span<const std::string> scenarios)
{
    const CommandLine line(describedOptions(), arguments, commonValueNames(scenarios));
    options.command = commandOf(line.words());
    options.wantsHelp = line.has("help");
    options.wantsVersion = line.has("version");
    if (options.wantsHelp || options.wantsVersion)
        return;
    takeWords(options, line.words(), scenarios);
    line.checkCommand(static_cast<std::size_t>(options.command));
    if (!options.paths.empty())
        options.format = ExportFormat::Csv;
    line.storeIn(options, kOptions);
    if (options.demo && line.has("ports"))
        throw UsageError("--ports cannot be used with --demo, which has a private directory of its "
                         "own");
    if (options.once && !options.frontEnd)
        options.frontEnd = FrontEndKind::Text;
    if (options.once &&
        (options.frontEnd == FrontEndKind::Window || options.frontEnd == FrontEndKind::Terminal))
        throw UsageError("--once is for --ui text and --ui json");
    if (options.overwritesRecord && !options.record)
        throw UsageError("--force is for --record FILE, which is not given");
    if (options.listsPaths && line.has("format"))
        throw UsageError("--list has no --format: its lines are paths");
    if (options.listsPaths)
        options.format = ExportFormat::PathList;
    if (options.isForSpreadsheet && options.format != ExportFormat::Csv)
        throw UsageError("--spreadsheet needs --format csv");
}

} // namespace

AppOptions parseAppOptions(std::span<const std::string> arguments,
                           std::span<const std::string> scenarios)
{
    AppOptions options;
    try {
        parse(options, arguments, scenarios);
    } catch (const UsageError& error) {
        options.error = error.what();
    }
    return options;
}

FrontEndKind defaultFrontEnd(bool hasDisplay, bool hasTerminal)
{
    if (hasDisplay)
        return FrontEndKind::Window;
    return hasTerminal ? FrontEndKind::Terminal : FrontEndKind::Text;
}

std::string appHelp(AppCommand command, std::span<const std::string> scenarios)
{
    return helpText("orvane", kCommands, static_cast<std::size_t>(command), describedOptions(),
                    commonValueNames(scenarios));
}

} // namespace orvane
