#pragma once

#include "screens/toolkit/AlertView.h"
#include "screens/toolkit/Font.h"
#include "screens/toolkit/Geometry.h"
#include "screens/toolkit/Interface.h"

#include <deque>
#include <memory>
#include <optional>
#include <string>
#include <string_view>

namespace orvane
{

class Playback;
class Window;

// The main screen: holds what is shown, and declares what the toolkit needs from a front end. Each
// front end is a subclass. There is one main screen at a time. Main thread only.
class Screen
{
public:
    Screen() = default;
    virtual ~Screen();
    Screen(const Screen&) = delete;
    Screen& operator=(const Screen&) = delete;

    // Without a front end: a screen of size 0 that shows nothing.
    static Screen& main();
    // Not owned; null for none.
    static void setMain(Screen* screen);

    // Supplied by the front end.

    [[nodiscard]] virtual Rect bounds() const = 0;
    // Without parts that the system keeps for itself, such as a status bar.
    [[nodiscard]] virtual Rect applicationFrame() const { return bounds(); }
    // The size of the text on one line.
    [[nodiscard]] virtual Size sizeWithFont(std::string_view text, const Font& font) const = 0;
    // Loads an interface file. On failure logs an error and returns null.
    [[nodiscard]] virtual std::unique_ptr<Interface> loadInterface(const std::string& name) = 0;
    // Something shown has changed. The front end draws later, once for all changes until then. It
    // must not read any object during this call.
    virtual void setNeedsUpdate() = 0;

    // The contents of the screen.

    // Null for none. Not owned.
    [[nodiscard]] Window* keyWindow() const { return _keyWindow; }
    void setKeyWindow(Window* window);

    // The alert in front; null for none.
    [[nodiscard]] const AlertView* alert() const;
    // Shown after the alerts that are up already.
    void showAlert(std::unique_ptr<AlertView> alert);
    // The button of the alert in front was pressed.
    void dismissAlert();

    // The recording whose controls are shown; null for none. Not owned.
    [[nodiscard]] Playback* playback() const { return _playback; }
    void setPlayback(Playback* playback);

private:
    Window* _keyWindow = nullptr;
    std::deque<std::unique_ptr<AlertView>> _alerts;
    Playback* _playback = nullptr;
};

} // namespace orvane
