#include "app/AppOptions.h"

#include "LogGenerator/LogTechnology.h"
#include "LogGenerator/TechnologyOption.h"
#include "app/ExportOptions.h"
#include "platform/base/CommandLine.h"
#include "platform/services/LogOption.h"

#include <algorithm>

namespace orvane
{

namespace
{

using Value = CommandLineOption::Value;

constexpr CommandLineOption kOptions[] = {
    {"help",          Value::None    },
    {"version",       Value::None    },
    {"demo",          Value::Optional},
    {"ui",            Value::Required},
    {"technology",    Value::Required},
    {"ports",         Value::Required},
    {"root",          Value::Required},
    {"refresh",       Value::Required},
    {"fullscreen",    Value::None    },
    {"record",        Value::Required},
    {"force",         Value::None    },
    {kLogOption,      Value::Required},
    {kLogLevelOption, Value::Required},
};

constexpr const char* kOpenCommand = "open";
constexpr const char* kDefaultScenario = "lte";
constexpr double kShortestRefresh = 0.01;
constexpr double kLongestRefresh = 86400;

std::string joined(std::span<const std::string> names)
{
    std::string text;
    for (const std::string& name : names)
        text += (text.empty() ? "" : ", ") + name;
    return text;
}

struct FrontEndName {
    const char* name;
    FrontEndKind kind;
};

constexpr FrontEndName kFrontEnds[] = {
    {"window",   FrontEndKind::Window  },
    {"terminal", FrontEndKind::Terminal},
    {"text",     FrontEndKind::Text    },
    {"json",     FrontEndKind::Json    },
};

void takeFrontEnd(AppOptions& options, CommandLine& line)
{
    const std::optional<std::string> name = line.value("ui");
    if (!name)
        return;
    for (const FrontEndName& known : kFrontEnds)
        if (*name == known.name)
            options.frontEnd = known.kind;
    if (!options.frontEnd)
        line.fail("--ui takes window, terminal, text or json, not \"" + *name + "\"");
}

void takeOpen(AppOptions& options, CommandLine& line)
{
    if (line.words().size() != 2 || line.words().back().empty()) {
        line.fail("open needs the name of one recording: orvane open FILE");
        return;
    }
    options.open = line.words().back();
    options.technology = technologyFromOption(line);
    for (const char* live : {"demo", "ports", "root", "record", "force"})
        if (line.has(live))
            line.fail(std::string("--") + live +
                      " is for the live view: a recording is opened without it");
}

void takeWords(AppOptions& options, CommandLine& line, std::span<const std::string> scenarios)
{
    if (line.words().empty())
        return;
    const std::string& word = line.words().front();
    if (word == kOpenCommand)
        takeOpen(options, line);
    else if (word == kExportCommand)
        line.fail("export must be the first word: orvane export FILE [OPTION...] [PATH...]");
    else if (std::find(scenarios.begin(), scenarios.end(), word) != scenarios.end())
        line.fail("\"" + word + "\" is no command: for the simulated phone write --demo=" + word);
    else
        line.fail("\"" + word + "\" is no command: see orvane --help");
}

void takeDemo(AppOptions& options, CommandLine& line, std::span<const std::string> scenarios)
{
    if (!line.has("demo"))
        return;
    const std::string scenario = line.value("demo").value_or("");
    options.demo = scenario.empty() ? kDefaultScenario : scenario;
    if (std::find(scenarios.begin(), scenarios.end(), *options.demo) == scenarios.end())
        line.fail("there is no simulated phone \"" + *options.demo + "\": --demo takes " +
                  joined(scenarios));
    if (line.has("ports"))
        line.fail("--ports cannot be used with --demo, which has a private directory of its own");
}

void takeRecord(AppOptions& options, CommandLine& line)
{
    options.record = line.value("record");
    options.overwritesRecord = line.has("force");
    if (options.record && options.record->empty())
        line.fail("--record needs the name of a file");
    if (options.overwritesRecord && !options.record)
        line.fail("--force is for --record FILE, which is not given");
}

} // namespace

AppOptions parseAppOptions(std::span<const std::string> arguments,
                           std::span<const std::string> scenarios)
{
    CommandLine line(kOptions, arguments);
    AppOptions options;
    if (!line.error()) {
        options.wantsHelp = line.has("help");
        options.wantsVersion = line.has("version");
        if (options.wantsHelp || options.wantsVersion)
            return options;
        takeWords(options, line, scenarios);
        if (line.has("technology") && !options.open)
            line.fail("--technology is for recordings: orvane open FILE --technology NAME");
        takeFrontEnd(options, line);
        options.isFullScreen = line.has("fullscreen");
        takeDemo(options, line, scenarios);
        takeRecord(options, line);
        options.ports = line.value("ports").value_or("");
        if (line.has("ports") && options.ports.empty())
            line.fail("--ports needs the name of a directory");
        options.root = line.value("root");
        if (options.root && options.root->empty())
            line.fail("--root needs the name of a directory");
        if (const auto seconds = line.number("refresh", kShortestRefresh, kLongestRefresh))
            options.refreshInterval = std::chrono::duration_cast<std::chrono::nanoseconds>(
                std::chrono::duration<double>(*seconds));
        options.log = logFromOptions(line, "orvane");
    }
    options.error = line.error();
    return options;
}

FrontEndKind defaultFrontEnd(bool hasDisplay, bool hasTerminal)
{
    if (hasDisplay)
        return FrontEndKind::Window;
    return hasTerminal ? FrontEndKind::Terminal : FrontEndKind::Text;
}

std::string appHelp(std::span<const std::string> scenarios)
{
    return "Usage: orvane [OPTION...]\n"
           "       orvane open FILE [OPTION...]\n"
           "       orvane export FILE [OPTION...] [PATH...]    (see orvane export --help)\n"
           "Shows what the modem knows about the radio network, from this machine's telephony "
           "server\n"
           "or from FILE, a recorded diagnostic log (.dlf) or a saved snapshot (.orvane).\n"
           "\n"
           "  --demo[=SCENARIO]         attach to a simulated phone: " +
           joined(scenarios) +
           "\n"
           "                            (default lte)\n"
           "  --ui window|terminal|text|json\n"
           "                            how to show it (default: a window where there is a "
           "display,\n"
           "                            else the terminal where standard output is one, else "
           "text)\n"
           "  --fullscreen              let the window fill the screen\n"
           "  --ports DIR               where the telephony server's ports are (default\n"
           "                            $ORVANE_PORTS, $XDG_RUNTIME_DIR/telephony or\n"
           "                            /tmp/telephony-UID)\n"
           "  --root DIR                take the log folder and the install marker below DIR\n"
           "  --refresh SECONDS         the refresh period (default 2.0)\n"
           "  --technology NAME         what FILE is a recording of: " +
           technologyNames() +
           "\n"
           "                            (default: by the log codes in it)\n"
           "  --record FILE             write every message of the modem to FILE, a diagnostic "
           "log\n"
           "  --force                   overwrite FILE where it is there already\n" +
           kLogOptionsHelp +
           "  --help                    show this\n"
           "  --version                 show the version\n"
           "\n"
           "With text and json, lines on standard input are commands: \"save DESCRIPTION\" saves "
           "a\n"
           "snapshot where saving is offered, \"quit\" ends the program.\n"
           "\n"
           "Exit status: 0 after a normal end, 2 for unusable arguments, 1 for any other "
           "failure.\n";
}

} // namespace orvane
