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
        : _loop(loop), _output(kind, options, loop), _once(options.once)
    {
    }

    [[nodiscard]] std::unique_ptr<LiveApp> makeApp(ModelEnvironment environment,
                                                   const FileSystem& files,
                                                   PreferencesStore& preferences) override
    {
        if (!_once)
            return std::make_unique<PrintingApp>(std::move(environment), files, preferences,
                                                 _output.printer());
        _timeout = environment.queue.repeatingTimer(*_once, [this] { giveUp(); });
        return std::make_unique<PrintingApp>(std::move(environment), files, preferences,
                                             _output.printer(), [this] {
                                                 _timeout->invalidate();
                                                 _loop.quit();
                                             });
    }

    void begin(LiveApp& app) override
    {
        // In the background of a terminal, reading would stop the program. With the signal ignored,
        // reading sees the end of the input, which does not end the program.
        std::signal(SIGTTIN, SIG_IGN);
        _commands.emplace(app, _output.printer(), [this] { _loop.quit(); });
        _lines.emplace(STDIN_FILENO, [this](std::string_view line, bool wasCut) {
            _commands->takeLine(line, wasCut);
        });
    }

    [[nodiscard]] int exitStatus() override
    {
        return _hasGivenUp ? kFailure : _output.exitStatus();
    }

private:
    void giveUp()
    {
        _timeout->invalidate();
        _hasGivenUp = true;
        complain("no display with rows came in time: start telephonyd, or give --once=SECONDS more "
                 "time");
        _loop.quit();
    }

    QtEventLoop& _loop;
    PrintedOutput _output;
    std::optional<std::chrono::nanoseconds> _once;
    std::unique_ptr<Timer> _timeout; // of _once
    bool _hasGivenUp = false;
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
