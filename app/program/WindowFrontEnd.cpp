#include "app/program/WindowFrontEnd.h"

#include "platform/linux/QtEventLoop.h"
#include "screens/window/QtScreen.h"

#include <utility>

namespace orvane
{

namespace
{

class WindowFrontEnd final : public FrontEnd
{
public:
    explicit WindowFrontEnd(QtScreen::Settings settings) : _screen(std::move(settings)) {}

    void end() override { _screen.hide(); }

private:
    QtScreen _screen;
};

} // namespace

std::unique_ptr<FrontEnd> makeWindowFrontEnd(const AppOptions& options, QtEventLoop& loop)
{
    QtScreen::Settings settings;
    settings.isSimulated = options.demo.has_value();
    settings.isFullScreen = options.isFullScreen;
    settings.waitingHint =
        options.command == AppCommand::Open ? "There is nothing in the recording at this time."
        : settings.isSimulated
            ? "The simulated phone is starting."
            : "Start telephonyd --port DEVICE for a modem, or try a simulated phone: "
              "orvane --demo";
    settings.onClose = [&loop] { loop.quit(); };
    return std::make_unique<WindowFrontEnd>(std::move(settings));
}

} // namespace orvane
