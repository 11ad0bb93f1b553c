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

// The main screen: what is shown, and what the toolkit asks of the front end that shows it. A front
// end is a subclass; one is the main screen at a time. Main thread only.
class Screen
{
public:
    Screen() = default;
    virtual ~Screen();
    Screen(const Screen&) = delete;
    Screen& operator=(const Screen&) = delete;

    // Where there is no front end, a screen of no size that shows nothing.
    static Screen& main();
    // Not owned; null for none.
    static void setMain(Screen* screen);

    // What a front end supplies.

    [[nodiscard]] virtual Rect bounds() const = 0;
    // Without the parts that the system keeps for itself, such as a status bar.
    [[nodiscard]] virtual Rect applicationFrame() const { return bounds(); }
    // The text as one line.
    [[nodiscard]] virtual Size sizeWithFont(std::string_view text, const Font& font) const = 0;
    // The view that an interface file describes; null, with an error line, where that fails.
    [[nodiscard]] virtual std::unique_ptr<Interface> loadInterface(const std::string& name) = 0;
    // Something that is shown has changed: draw it soon, once for all changes until then. Must not
    // read anything yet.
    virtual void setNeedsUpdate() = 0;

    // What is shown.

    // Null for none. Not owned.
    [[nodiscard]] Window* keyWindow() const { return _keyWindow; }
    void setKeyWindow(Window* window);

    // The alert in front; null for none.
    [[nodiscard]] const AlertView* alert() const;
    // After the alerts that are up already.
    void showAlert(std::unique_ptr<AlertView> alert);
    // Its button was pressed.
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
