#pragma once

#include "platform/services/Lifetime.h"
#include "platform/services/MainQueue.h"
#include "screens/terminal/Page.h"
#include "screens/terminal/SaveForm.h"
#include "screens/terminal/StackPage.h"
#include "screens/terminal/TerminalDevice.h"
#include "screens/toolkit/Screen.h"

#include <functional>
#include <memory>
#include <string>

namespace orvane
{

// The front end for a terminal. Draws the navigation stack, the save screen and the alerts as text,
// and passes them keys and clicks. The owner of the event loop reports events of the terminal. It
// is the main screen for as long as it exists.
class TerminalScreen final : public Screen
{
public:
    struct Settings {
        bool isSimulated = false;
        // What the user can do while the program waits for the telephony server.
        std::string waitingHint;
        std::function<void()> onQuit;
    };

    // Both are referred to and must outlive the screen.
    TerminalScreen(TerminalDevice& device, MainQueue& queue, Settings settings);
    ~TerminalScreen() override;

    // Input has arrived.
    void inputIsReady();
    // The terminal has another size.
    void sizeHasChanged();
    // Stops the process as Ctrl-Z does. Returns when it continues.
    void suspend();
    // The process continues after another process stopped it.
    void wasContinued();

    [[nodiscard]] Rect bounds() const override;
    [[nodiscard]] Size sizeWithFont(std::string_view text, const Font& font) const override;
    [[nodiscard]] std::unique_ptr<Interface> loadInterface(const std::string& name) override;
    void setNeedsUpdate() override;

private:
    void update();
    // Makes the picture of the current state, and decides what keys do in it.
    void draw();
    void show();
    void drawPages();
    void markForAMoment();
    void turnIndicator();
    void take(const Key& key);
    void takeCommand(const Key& key);
    void click(const Key& key);
    // The page that gets the keys.
    Page& front();
    // Null while there is no save screen.
    [[nodiscard]] SaveForm* shownForm() const;

    TerminalDevice& _device;
    MainQueue& _queue;
    Settings _settings;
    StackPage _stack;
    std::unique_ptr<SaveForm> _form;
    std::unique_ptr<Page> _alert;
    std::unique_ptr<Page> _help;
    Canvas _canvas;
    bool _isUpdating = false;
    bool _isUpdateQueued = false;
    bool _isHelpWanted = false;
    int _turn = 0;
    std::unique_ptr<Timer> _indicatorTimer;
    std::size_t _changesMarked = 0;
    Lifetime _lifetime;
};

} // namespace orvane
