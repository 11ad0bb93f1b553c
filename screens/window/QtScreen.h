#pragma once

#include "screens/toolkit/Screen.h"

#include <functional>
#include <memory>
#include <string>

class QWidget;

namespace orvane
{

class UiInterface;
class WindowFrame;

// The toolkit's screen as a window of real widgets. It is shown as long as there is a key window.
//
// Changes are drawn together, once the event loop is back; what has not changed is not touched.
// Needs a QtWindowApplication. Is the main screen as long as it lives.
class QtScreen final : public Screen
{
public:
    struct Settings {
        bool isSimulated = false;  // says in the title bar that the phone is
        bool isFullScreen = false; // also on a screen as narrow as a phone's, whatever this says
        bool isAnimated = true;
        std::string waitingHint;       // what to do while no telephony server answers
        std::function<void()> onClose; // the user wants the program to end
    };

    explicit QtScreen(Settings settings);
    ~QtScreen() override;

    // That of the window's content.
    [[nodiscard]] Rect bounds() const override;
    [[nodiscard]] Size sizeWithFont(std::string_view text, const Font& font) const override;
    // From the resource NAME.ui.
    [[nodiscard]] std::unique_ptr<Interface> loadInterface(const std::string& name) override;
    void setNeedsUpdate() override;

    // Takes the window off the screen until the next update.
    void hide();
    // Draws what has changed now.
    void update();
    [[nodiscard]] WindowFrame& frame() const { return *_frame; }

private:
    struct Interfaces;

    void showFrame();

    Settings _settings;
    std::unique_ptr<Interfaces> _interfaces;
    std::unique_ptr<WindowFrame> _frame;
    bool _isUpdateQueued = false;
    bool _isUpdating = false;
};

} // namespace orvane
