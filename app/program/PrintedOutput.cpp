#include "app/program/PrintedOutput.h"

#include "app/program/FrontEnd.h"
#include "platform/linux/QtEventLoop.h"
#include "screens/print/JsonPrinter.h"
#include "screens/print/TextPrinter.h"

#include <unistd.h>

namespace orvane
{

PrintedOutput::PrintedOutput(FrontEndKind kind, const AppOptions& options, QtEventLoop& loop)
    : _loop(loop), _output(STDOUT_FILENO)
{
    const Printer::Write write = [this](std::string_view text) { print(text); };
    const bool isSimulated = options.demo.has_value();
    const JsonDetails details = !options.printsDetails                ? JsonDetails::None
                                : options.command == AppCommand::Live ? JsonDetails::OfLiveView
                                                                      : JsonDetails::OfRecording;
    if (kind == FrontEndKind::Json)
        _printer = std::make_unique<JsonPrinter>(write, isSimulated, details);
    else
        _printer = std::make_unique<TextPrinter>(write, isSimulated);
}

int exitStatusOf(const OutputDescriptor& output)
{
    if (output.state() != OutputDescriptor::State::Failed)
        return 0;
    complain(std::string("standard output cannot be written: ") + output.failure() +
             "; send it somewhere else");
    return kFailure;
}

void PrintedOutput::print(std::string_view text)
{
    const auto state = _output.write(text);
    // Interrupted: the signal's own callback ends the loop.
    if (state == OutputDescriptor::State::Closed || state == OutputDescriptor::State::Failed)
        _loop.quit();
}

} // namespace orvane
