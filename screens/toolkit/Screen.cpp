#include "screens/toolkit/Screen.h"

#include <utility>

namespace orvane
{

namespace
{

class NoScreen final : public Screen
{
public:
    [[nodiscard]] Rect bounds() const override { return {}; }
    [[nodiscard]] Size sizeWithFont(std::string_view, const Font&) const override { return {}; }
    [[nodiscard]] std::unique_ptr<Interface> loadInterface(const std::string&) override
    {
        return nullptr;
    }
    void setNeedsUpdate() override {}
};

Screen* mainScreen = nullptr;

} // namespace

Screen::~Screen()
{
    if (mainScreen == this)
        mainScreen = nullptr;
}

Screen& Screen::main()
{
    static NoScreen none;
    return mainScreen ? *mainScreen : none;
}

void Screen::setMain(Screen* screen) { mainScreen = screen; }

void Screen::setKeyWindow(Window* window)
{
    _keyWindow = window;
    setNeedsUpdate();
}

const AlertView* Screen::alert() const { return _alerts.empty() ? nullptr : _alerts.front().get(); }

void Screen::showAlert(std::unique_ptr<AlertView> alert)
{
    if (!alert)
        return;
    _alerts.push_back(std::move(alert));
    setNeedsUpdate();
}

void Screen::dismissAlert()
{
    if (_alerts.empty())
        return;
    _alerts.pop_front();
    setNeedsUpdate();
}

void Screen::setPlayback(Playback* playback)
{
    _playback = playback;
    setNeedsUpdate();
}

} // namespace orvane
