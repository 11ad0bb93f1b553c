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

// The front end for a terminal: draws the navigation stack, the save screen and the alerts as text,
// and feeds them what is typed and clicked. Whoever runs the event loop tells it what happens to
// the terminal. Is the main screen as long as it lives.
class TerminalScreen final : public Screen
{
public:
    struct Settings {
        bool isSimulated = false;
        // What a person can do while the telephony server is being waited for.
        std::string waitingHint;
        std::function<void()> onQuit;
    };

    // Both are referred to and must outlive the screen.
    TerminalScreen(TerminalDevice& device, MainQueue& queue, Settings settings);
    ~TerminalScreen() override;

    // Something can be read.
    void inputIsReady();
    // It has another size.
    void sizeHasChanged();
    // The process is to stop, as by Ctrl-Z; returns when it goes on.
    void suspend();
    // The process goes on after it was stopped by somebody else.
    void wasContinued();

    [[nodiscard]] Rect bounds() const override;
    [[nodiscard]] Size sizeWithFont(std::string_view text, const Font& font) const override;
    [[nodiscard]] std::unique_ptr<Interface> loadInterface(const std::string& name) override;
    void setNeedsUpdate() override;

private:
    void update();
    // The picture of what is shown now, and what keys mean in it.
    void draw();
    void show();
    void drawPages();
    void markForAMoment();
    void turnIndicator();
    void take(const Key& key);
    void takeCommand(const Key& key);
    void click(const Key& key);
    // The one that has the keys.
    Page& front();
    // Null while the save screen is not there.
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
