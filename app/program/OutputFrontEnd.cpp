#include "app/CommandInterpreter.h"
#include "app/program/FrontEnd.h"
#include "platform/OutputDescriptor.h"
#include "platform/qt/LineReader.h"
#include "platform/qt/QtEventLoop.h"
#include "ui/output/JsonPane.h"
#include "ui/output/PrintingPaneController.h"
#include "ui/output/TextPane.h"

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
    OutputFrontEnd(FrontEndKind kind, bool isSimulated, QtEventLoop& loop) : _loop(loop)
    {
        const OutputPane::Write write = [this](std::string_view text) { print(text); };
        if (kind == FrontEndKind::Json)
            _pane = std::make_unique<JsonPane>(write, isSimulated);
        else
            _pane = std::make_unique<TextPane>(write, isSimulated);
    }

    [[nodiscard]] OrvaneApp::MakeRootPane rootPaneMaker() override
    {
        return [this](Shell& shell) {
            return std::make_shared<PrintingPaneController>(shell, *_pane);
        };
    }

    void begin(OrvaneApp& app) override
    {
        _commands.emplace(app, *_pane, [this] { _loop.quit(); });
        _lines.emplace(STDIN_FILENO, [this](std::string_view line, bool wasCut) {
            _commands->takeLine(line, wasCut);
        });
    }

    [[nodiscard]] int exitStatus() override
    {
        if (_output.state() != OutputDescriptor::State::Failed)
            return 0;
        complain(std::string("standard output cannot be written: ") + _output.failure() +
                 "; send it somewhere else");
        return 1;
    }

private:
    void print(std::string_view text)
    {
        const auto state = _output.write(text);
        // Interrupted: the signal's own callback ends the loop.
        if (state == OutputDescriptor::State::Closed || state == OutputDescriptor::State::Failed)
            _loop.quit();
    }

    QtEventLoop& _loop;
    OutputDescriptor _output{STDOUT_FILENO};
    std::unique_ptr<OutputPane> _pane;
    std::optional<CommandInterpreter> _commands;
    std::optional<LineReader> _lines;
};

} // namespace

std::unique_ptr<FrontEnd> makeOutputFrontEnd(FrontEndKind kind, const AppOptions& options,
                                             QtEventLoop& loop)
{
    return std::make_unique<OutputFrontEnd>(kind, options.demo.has_value(), loop);
}

} // namespace orvane
