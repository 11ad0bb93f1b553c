#include "telephonyd/DaemonOptions.h"

#include "LogGenerator/LogTechnology.h"
#include "LogGenerator/TechnologyOption.h"
#include "platform/base/CommandLine.h"
#include "platform/base/TelephonyConstants.h"
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
    {"replay",        Value::Required},
    {"messages",      Value::Optional},
    {"technology",    Value::Required},
    {"speed",         Value::Required},
    {"loop",          Value::None    },
    {"ports",         Value::Required},
    {kLogOption,      Value::Required},
    {kLogLevelOption, Value::Required},
};

constexpr const char* kDefaultScenario = "lte";
constexpr const char* kFullSpeed = "max";
constexpr double kSlowest = 0.001;
constexpr double kFastest = 1000;

std::string joined(std::span<const std::string> names)
{
    std::string text;
    for (const std::string& name : names)
        text += (text.empty() ? "" : ", ") + name;
    return text;
}

void refuseReplayOptions(CommandLine& line)
{
    for (const char* name : {"technology", "speed", "loop"})
        if (line.has(name))
            line.fail(std::string("--") + name +
                      " is for a recording: use it with --replay FILE, or leave it out");
}

void takeDemo(DaemonOptions& options, CommandLine& line, std::span<const std::string> scenarios)
{
    const std::string scenario = line.value("demo").value_or("");
    options.demo = scenario.empty() ? kDefaultScenario : scenario;
    if (std::find(scenarios.begin(), scenarios.end(), *options.demo) == scenarios.end())
        line.fail("there is no simulated phone \"" + *options.demo + "\": --demo takes " +
                  joined(scenarios));
    refuseReplayOptions(line);
}

void takeMessages(DaemonOptions& options, CommandLine& line)
{
    const std::string name = line.value("messages").value_or("");
    options.messages = technologyNamed(name.empty() ? kDefaultScenario : name);
    // The cell monitor's messages are property lists without log codes.
    if (!options.messages || *options.messages == kTSLogChannelTechnology_IFX)
        line.fail("--messages takes lte, umts, utran or cdma, not \"" + name + "\"");
    refuseReplayOptions(line);
}

void takeReplay(DaemonOptions& options, CommandLine& line)
{
    options.replay = line.value("replay");
    if (options.replay->empty())
        line.fail("--replay needs the name of a recording");
    options.technology = technologyFromOption(line);
    if (line.value("speed") == kFullSpeed)
        options.speed.reset();
    else if (const auto speed = line.value("speed")) {
        options.speed = decimalNumber(*speed);
        if (!options.speed || *options.speed < kSlowest || *options.speed > kFastest)
            line.fail("--speed takes a number from 0.001 to 1000, or max, not \"" + *speed + "\"");
    }
    options.loops = line.has("loop");
}

} // namespace

DaemonOptions parseDaemonOptions(std::span<const std::string> arguments,
                                 std::span<const std::string> scenarios)
{
    CommandLine line(kOptions, arguments);
    DaemonOptions options;
    if (!line.error()) {
        options.wantsHelp = line.has("help");
        options.wantsVersion = line.has("version");
        if (options.wantsHelp || options.wantsVersion)
            return options;
        if (!line.words().empty())
            line.fail("\"" + line.words().front() +
                      "\" is no option: give a recording as --replay FILE");
        const int given = line.has("demo") + line.has("replay") + line.has("messages");
        if (given != 1)
            line.fail(given != 0
                          ? "--demo, --replay and --messages exclude each other: give one of them"
                          : "give --demo=SCENARIO, --replay FILE or --messages=NAME: there is "
                            "nothing to serve otherwise");
        else if (line.has("demo"))
            takeDemo(options, line, scenarios);
        else if (line.has("messages"))
            takeMessages(options, line);
        else
            takeReplay(options, line);
        options.ports = line.value("ports").value_or("");
        if (line.has("ports") && options.ports.empty())
            line.fail("--ports needs the name of a directory");
        options.log = logFromOptions(line, "telephonyd");
    }
    options.error = line.error();
    return options;
}

std::string daemonHelp(std::span<const std::string> scenarios)
{
    return "Usage: telephonyd --demo=SCENARIO [OPTION...]\n"
           "       telephonyd --replay FILE [OPTION...]\n"
           "       telephonyd --messages=NAME [OPTION...]\n"
           "A telephony server for machines without one.\n"
           "\n"
           "  --demo[=SCENARIO]         serve a simulated phone: " +
           joined(scenarios) +
           " (default lte)\n"
           "  --replay FILE             serve a recorded diagnostic log (.dlf)\n"
           "  --messages[=NAME]         serve messages typed on standard input, one a line: a log\n"
           "                            code and the bytes behind the message's header, such as\n"
           "                            0xB0C2 01 DD 00 9C 18; NAME is lte, umts, utran or cdma\n"
           "                            (default lte)\n"
           "  --technology NAME         what was recorded: " +
           technologyNames() +
           "\n"
           "                            (default: by the recording's log codes)\n"
           "  --speed N|max             seconds of the recording a second, 0.001 to 1000, or as\n"
           "                            fast as clients take it (default 1)\n"
           "  --loop                    start over at the recording's end\n"
           "  --ports DIR               where the server's ports are (default $ORVANE_PORTS,\n"
           "                            $XDG_RUNTIME_DIR/telephony or /tmp/telephony-UID)\n" +
           kLogOptionsHelp +
           "  --help                    show this\n"
           "  --version                 show the version\n"
           "\n"
           "Runs until it is interrupted. Exit status: 0 after a normal end, 2 for unusable\n"
           "arguments, 1 for any other failure.\n";
}

} // namespace orvane
