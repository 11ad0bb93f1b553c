#include "app/program/TerminalFrontEnd.h"

#include "platform/linux/DescriptorWatcher.h"
#include "platform/linux/QtEventLoop.h"
#include "platform/linux/QtMainQueue.h"
#include "platform/linux/SignalWatcher.h"
#include "screens/terminal/CursesDevice.h"
#include "screens/terminal/TerminalScreen.h"

#include <chrono>
#include <csignal>
#include <unistd.h>
#include <utility>

namespace orvane
{

namespace
{

using namespace std::chrono_literals;

constexpr auto kReturnInterval = 200ms;

// Passes events of the loop on to the terminal's screen.
class TerminalFrontEnd final : public FrontEnd
{
public:
    explicit TerminalFrontEnd(TerminalScreen::Settings settings)
        : _screen(_device, _queue, std::move(settings)),
          _input(STDIN_FILENO, DescriptorWatcher::For::Reading, [this] { readInput(); }),
          _signals([this](int signal) { take(signal); }, {SIGWINCH, SIGTSTP, SIGCONT})
    {
    }

    void end() override { _device.giveBack(); }

private:
    void readInput()
    {
        _screen.inputIsReady();
        followJob();
    }

    void take(int signal)
    {
        if (signal == SIGWINCH)
            _screen.sizeHasChanged();
        else if (signal == SIGTSTP)
            _screen.suspend();
        else
            _screen.wasContinued();
        followJob();
    }

    // In the background, typed keys belong to other programs. A process that was running gets no
    // signal when it comes to the foreground.
    void followJob()
    {
        const bool isInFront = _device.hasTerminal();
        _input.setEnabled(isInFront);
        if (isInFront)
            _return.reset();
        else if (!_return)
            _return = _queue.repeatingTimer(kReturnInterval, [this] {
                _screen.wasContinued();
                followJob();
            });
    }

    CursesDevice _device;
    QtMainQueue _queue;
    TerminalScreen _screen;
    DescriptorWatcher _input;
    std::unique_ptr<Timer> _return; // while in the background
    SignalWatcher _signals;
};

} // namespace

std::unique_ptr<FrontEnd> makeTerminalFrontEnd(const AppOptions& options, QtEventLoop& loop)
{
    TerminalScreen::Settings settings;
    settings.isSimulated = options.demo.has_value();
    settings.waitingHint =
        options.command == AppCommand::Open ? "There is nothing in the recording at this time."
        : settings.isSimulated
            ? "The simulated phone is starting."
            : "Start telephonyd --port DEVICE for a modem, or leave with q and try a "
              "simulated phone: orvane --demo";
    settings.onQuit = [&loop] { loop.quit(); };
    return std::make_unique<TerminalFrontEnd>(std::move(settings));
}

} // namespace orvane
