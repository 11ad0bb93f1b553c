#include "app/ExportOptions.h"

#include "LogGenerator/LogTechnology.h"
#include "LogGenerator/TechnologyOption.h"
#include "platform/base/CommandLine.h"
#include "platform/services/LogOption.h"

namespace orvane
{

namespace
{

using Value = CommandLineOption::Value;

constexpr CommandLineOption kOptions[] = {
    {"help",          Value::None    },
    {"format",        Value::Required},
    {"every",         Value::Required},
    {"list",          Value::None    },
    {"technology",    Value::Required},
    {kLogOption,      Value::Required},
    {kLogLevelOption, Value::Required},
};

constexpr double kShortestPeriod = 0.001;
constexpr double kLongestPeriod = 86400;

void takeWords(ExportRequest& request, CommandLine& line)
{
    const std::vector<std::string>& words = line.words();
    if (words.empty() || words.front().empty()) {
        line.fail("export needs the name of a recording: orvane export FILE [PATH...]");
        return;
    }
    request.file = words.front();
    request.paths.assign(words.begin() + 1, words.end());
    for (const std::string& path : request.paths)
        if (path.empty())
            line.fail("a PATH cannot be empty: see orvane export --list FILE");
}

void takeFormat(ExportOptions& options, CommandLine& line)
{
    const std::optional<std::string> name = line.value("format");
    if (line.has("list")) {
        options.format = ExportFormat::PathList;
        if (name)
            line.fail("--list has no --format: its lines are paths");
    } else if (name ? *name == "csv" : !options.request.paths.empty()) {
        options.format = ExportFormat::Csv;
    } else if (name && *name != "jsonl") {
        line.fail("--format takes csv or jsonl, not \"" + *name + "\"");
    }
}

} // namespace

ExportOptions parseExportOptions(std::span<const std::string> arguments)
{
    CommandLine line(kOptions, arguments);
    ExportOptions options;
    if (!line.error()) {
        options.wantsHelp = line.has("help");
        if (options.wantsHelp)
            return options;
        takeWords(options.request, line);
        takeFormat(options, line);
        options.request.technology = technologyFromOption(line);
        if (const auto seconds = line.number("every", kShortestPeriod, kLongestPeriod))
            options.request.period =
                std::chrono::duration_cast<LogTime>(std::chrono::duration<double>(*seconds));
        options.log = logFromOptions(line, "orvane");
    }
    options.error = line.error();
    return options;
}

std::string exportHelp()
{
    return "Usage: orvane export FILE [OPTION...] [PATH...]\n"
           "Writes rows of a recording to standard output, one line a refresh period.\n"
           "\n"
           "FILE is a diagnostic log (.dlf) or a saved snapshot (.orvane), which gives a line for "
           "each\n"
           "of its entries. A PATH is that of a row, as in \"/Serving Cell Info/Cell Identity\", "
           "or of\n"
           "a group for all its rows; * stands for any name, such as the elements of a list. "
           "Without\n"
           "a PATH, every row is written.\n"
           "\n"
           "  --format csv|jsonl        a header and a column a row, or a JSON object a line "
           "(default\n"
           "                            csv with a PATH, else jsonl)\n"
           "  --every SECONDS           the refresh period (default 2.0)\n"
           "  --list                    print the paths that occur\n"
           "  --technology NAME         what the log is of: " +
           technologyNames() +
           "\n"
           "                            (default: found by its log codes)\n" +
           kLogOptionsHelp +
           "  --help                    show this\n"
           "\n"
           "Exit status: 0 after a normal end, 2 for unusable arguments, 1 for any other "
           "failure.\n";
}

} // namespace orvane
