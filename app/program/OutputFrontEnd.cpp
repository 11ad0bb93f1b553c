#include "app/CommandInterpreter.h"
#include "app/PrintingApp.h"
#include "app/program/FrontEnd.h"
#include "app/program/PrintedOutput.h"
#include "platform/linux/LineReader.h"
#include "platform/linux/QtEventLoop.h"

#include <csignal>
#include <optional>
#include <unistd.h>

namespace orvane
{

namespace
{

// Prints on standard output and takes commands from standard input.
class OutputFrontEnd final : public FrontEnd
{
public:
    OutputFrontEnd(FrontEndKind kind, const AppOptions& options, QtEventLoop& loop)
        : _loop(loop), _output(kind, options, loop)
    {
    }

    [[nodiscard]] std::unique_ptr<LiveApp> makeApp(ModelEnvironment environment,
                                                   const FileSystem& files,
                                                   PreferencesStore& preferences) override
    {
        return std::make_unique<PrintingApp>(std::move(environment), files, preferences,
                                             _output.printer());
    }

    void begin(LiveApp& app) override
    {
        // In the background of a terminal, reading it would stop the program; ignored, it is the
        // end of the input, which ends nothing.
        std::signal(SIGTTIN, SIG_IGN);
        _commands.emplace(app, _output.printer(), [this] { _loop.quit(); });
        _lines.emplace(STDIN_FILENO, [this](std::string_view line, bool wasCut) {
            _commands->takeLine(line, wasCut);
        });
    }

    [[nodiscard]] int exitStatus() override { return _output.exitStatus(); }

private:
    QtEventLoop& _loop;
    PrintedOutput _output;
    std::optional<CommandInterpreter> _commands;
    std::optional<LineReader> _lines;
};

} // namespace

std::unique_ptr<FrontEnd> makeOutputFrontEnd(FrontEndKind kind, const AppOptions& options,
                                             QtEventLoop& loop)
{
    return std::make_unique<OutputFrontEnd>(kind, options, loop);
}

} // namespace orvane
