#include "app/program/PrintedOutput.h"

#include "app/program/FrontEnd.h"
#include "platform/linux/QtEventLoop.h"
#include "screens/print/JsonPane.h"
#include "screens/print/TextPane.h"

#include <unistd.h>

namespace orvane
{

PrintedOutput::PrintedOutput(FrontEndKind kind, bool isSimulated, QtEventLoop& loop)
    : _loop(loop), _output(STDOUT_FILENO)
{
    const OutputPane::Write write = [this](std::string_view text) { print(text); };
    if (kind == FrontEndKind::Json)
        _pane = std::make_unique<JsonPane>(write, isSimulated);
    else
        _pane = std::make_unique<TextPane>(write, isSimulated);
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
