#include "app/program/TerminalFrontEnd.h"

#include "platform/qt/DescriptorWatcher.h"
#include "platform/qt/QtEventLoop.h"
#include "platform/qt/QtMainQueue.h"
#include "platform/qt/SignalWatcher.h"
#include "platform/terminal/CursesDevice.h"
#include "platform/terminal/TerminalScreen.h"

#include <csignal>
#include <unistd.h>
#include <utility>

namespace orvane
{

namespace
{

// Tells the terminal's screen what the event loop hears.
class TerminalFrontEnd final : public FrontEnd
{
public:
    explicit TerminalFrontEnd(TerminalScreen::Settings settings)
        : _screen(_device, _queue, std::move(settings)),
          _input(STDIN_FILENO, DescriptorWatcher::For::Reading, [this] { _screen.inputIsReady(); }),
          _signals([this](int signal) { take(signal); }, {SIGWINCH, SIGTSTP, SIGCONT})
    {
    }

private:
    void take(int signal)
    {
        if (signal == SIGWINCH)
            _screen.sizeHasChanged();
        else if (signal == SIGTSTP)
            _screen.suspend();
        else
            _screen.wasContinued();
    }

    CursesDevice _device;
    QtMainQueue _queue;
    TerminalScreen _screen;
    DescriptorWatcher _input;
    SignalWatcher _signals;
};

} // namespace

std::unique_ptr<FrontEnd> makeTerminalFrontEnd(const AppOptions& options, QtEventLoop& loop)
{
    TerminalScreen::Settings settings;
    settings.isSimulated = options.demo.has_value();
    settings.waitingHint = options.open ? "There is nothing in the recording at this time."
                           : settings.isSimulated
                               ? "The simulated phone is starting."
                               : "Start telephonyd on this machine, or leave with q and try a "
                                 "simulated phone: orvane --demo";
    settings.onQuit = [&loop] { loop.quit(); };
    return std::make_unique<TerminalFrontEnd>(std::move(settings));
}

} // namespace orvane
