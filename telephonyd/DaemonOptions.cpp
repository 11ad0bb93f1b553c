#include "telephonyd/DaemonOptions.h"

#include "platform/base/CommandHelp.h"
#include "platform/base/Technology.h"

namespace orvane
{

namespace
{

// A command is asked for by the option of its name.
constexpr CommandLineCommand kCommands[] = {
    {"demo",        "--demo=SCENARIO [OPTION...]",
     "A telephony server for a modem, a recording or a simulated phone.", "Runs until it is interrupted."},
    {"replay",      "--replay FILE [OPTION...]",   "",                    ""                             },
    {"messages",    "--messages=NAME [OPTION...]", "",                    ""                             },
    {"port",        "--port DEVICE [OPTION...]",   "",                    ""                             },
    {"modem",       "--modem[=ID] [OPTION...]",    "",                    ""                             },
    {"list-modems", "--list-modems [OPTION...]",   "",                    ""                             },
};

constexpr unsigned kReplay = 1U << 1;
constexpr unsigned kPort = 1U << 3;
constexpr unsigned kModem = 1U << 4;
constexpr unsigned kListModems = 1U << 5;
constexpr CommandSet kRecordings{kReplay,
                                 "is for a recording: use it with --replay FILE, or leave it out"};
constexpr CommandSet kRecordingsAndModems{kReplay | kPort | kModem,
                                          "is for a recording or a modem: use it with --replay "
                                          "FILE, --modem or --port DEVICE, or leave it out"};
constexpr CommandSet kModems{
    kModem | kListModems, "is for modems: use it with --modem or --list-modems, or leave it out"};
constexpr CommandSet kLists{kListModems,
                            "is for a list: use it with --list-modems, or leave it out"};

using DaemonOption = Option<DaemonOptions>;

constexpr DaemonOption kOptions[] = {
    DaemonOption({"demo", "[SCENARIO]", "serve a simulated phone: {} (default lte)"},
                 [](DaemonOptions& options, const GivenOption& given) {
                     options.demo = given.textOrFirst();
                 }),
    DaemonOption({"replay", "FILE", "serve a recorded diagnostic log (.dlf)"},
                 &DaemonOptions::replay),
    // Not of the cell monitor, whose messages are property lists without log codes.
    DaemonOption({"messages", "[lte|umts|utran|cdma]",
                  "serve messages typed on standard input, one a line: a log code and the bytes "
                  "after the message's header, such as 0xB0C2 01 DD 00 9C 18 (default lte)"},
                 [](DaemonOptions& options, const GivenOption& given) {
                     options.messages = technologyNamed(given.textOrFirst());
                 }),
    DaemonOption(
        {"port", "DEVICE", "serve the modem whose diagnostic port this is, such as /dev/ttyUSB0"},
        &DaemonOptions::port),
    DaemonOption(
        {"modem", "[ID]",
         "serve the modem of this ID, found through ModemManager (default: the only modem there "
         "is; --port DEVICE names its diagnostic port where ModemManager does not)"},
        [](DaemonOptions& options, const GivenOption& given) { options.modem = given.value(); }),
    DaemonOption(
        {"list-modems", "", "list the modems that ModemManager knows, with their IDs, and end"},
        &DaemonOptions::listsModems),
    DaemonOption({"json", "", "a line of JSON for each modem", kLists},
                 &DaemonOptions::listsAsJson),
    DaemonOption({"bus", "system|session", "where ModemManager is (default system)", kModems},
                 [](DaemonOptions& options, const GivenOption& given) {
                     options.usesSessionBus = given.choice() == 1;
                 }),
    DaemonOption(
        {"technology", "NAME",
         "what was recorded, or what the modem serves: {} (default: by the log codes that come)",
         kRecordingsAndModems},
        [](DaemonOptions& options, const GivenOption& given) {
            options.technology = technologyNamed(given.text());
        }),
    DaemonOption({"speed", "N|max",
                  "how many seconds of the recording to send in a second, 0.001 to 1000, or max "
                  "for as fast as clients take it (default 1)",
                  kRecordings, 0.001, 1000},
                 [](DaemonOptions& options, const GivenOption& given) {
                     options.speed = given.value() == "max" ? std::nullopt
                                                            : std::optional<double>(given.number());
                 }),
    DaemonOption({"loop", "", "start over at the recording's end", kRecordings},
                 &DaemonOptions::loops),
    DaemonOption({"ports", "DIR",
                  "where the server's ports are (default $ORVANE_PORTS, $XDG_RUNTIME_DIR/telephony "
                  "or /tmp/telephony-UID)"},
                 &DaemonOptions::ports),
    kLogOption<DaemonOptions>,
    kLogLevelOption<DaemonOptions>,
    kHelpOption<DaemonOptions>,
    kVersionOption<DaemonOptions>,
};

std::vector<CommandLineOption> describedOptions()
{
    return {std::begin(kOptions), std::end(kOptions)};
}

void parse(DaemonOptions& options, std::span<const std::string> arguments,
           std::span<const std::string> scenarios)
{
    const CommandLine line(describedOptions(), arguments, commonValueNames(scenarios));
    options.wantsHelp = line.has("help");
    options.wantsVersion = line.has("version");
    if (options.wantsHelp || options.wantsVersion)
        return;
    if (!line.words().empty())
        throw UsageError("\"" + line.words().front() +
                         "\" is not an option: give a recording as --replay FILE");
    std::size_t given = 0;
    for (std::size_t i = 0; i < std::size(kCommands); ++i) {
        if (!line.has(kCommands[i].name))
            continue;
        line.checkCommand(i);
        ++given;
    }
    if (given == 2 && line.has("modem") && line.has("port"))
        given = 1;
    if (given > 1)
        throw UsageError("--demo, --replay, --messages, --port, --modem and --list-modems exclude "
                         "each other: give one of them");
    if (given == 0)
        throw UsageError("give --demo=SCENARIO, --replay FILE, --messages=NAME, --modem or --port "
                         "DEVICE: there is nothing to serve otherwise");
    line.storeIn(options, kOptions);
}

} // namespace

DaemonOptions parseDaemonOptions(std::span<const std::string> arguments,
                                 std::span<const std::string> scenarios)
{
    DaemonOptions options;
    try {
        parse(options, arguments, scenarios);
    } catch (const UsageError& error) {
        options.error = error.what();
    }
    return options;
}

std::string daemonHelp(std::span<const std::string> scenarios)
{
    return helpText("telephonyd", kCommands, 0, describedOptions(), commonValueNames(scenarios));
}

} // namespace orvane
