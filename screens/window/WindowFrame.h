#pragma once

#include "screens/toolkit/Screen.h"

#include <QWidget>

#include <functional>

namespace orvane
{

class AlertWidget;
class NavigationController;
class PaneDeck;
class PlaybackBar;
class SheetWidget;
class TitleBar;
class ToolbarWidget;
class UiInterface;

// The window: the title bar, the panes, the controls of a recording if there is one, and the
// toolbar. The sheet and the alert are in front of them.
class WindowFrame final : public QWidget
{
public:
    struct Settings {
        QString mark;        // in the title bar; empty for none
        QString waitingHint; // while there is no data; empty for none
        bool isAnimated = true;
        std::function<void()> onClose;
    };

    // Shows `screen`, which must outlive it.
    WindowFrame(Screen& screen, Settings settings);
    ~WindowFrame() override;

    // Shows the current contents of the toolkit's objects. Changes only what differs.
    // `findInterface` returns the interface of a modal screen's view, or null.
    void sync(const std::function<UiInterface*(const View*)>& findInterface);

    // Goes one step back: closes the alert, the sheet or the top pane.
    void goBack();
    void pressSave();

    [[nodiscard]] TitleBar& titleBar() const { return *_titleBar; }
    [[nodiscard]] PaneDeck& deck() const { return *_deck; }
    [[nodiscard]] ToolbarWidget& toolbar() const { return *_toolbar; }
    [[nodiscard]] PlaybackBar& playbackBar() const { return *_playback; }
    [[nodiscard]] SheetWidget& sheet() const { return *_sheet; }
    [[nodiscard]] AlertWidget& alert() const { return *_alert; }

protected:
    void closeEvent(QCloseEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;

private:
    [[nodiscard]] NavigationController* navigation() const;
    void popPane();
    void pressToolbarItem(std::size_t index);
    void syncTitle(NavigationController* stack);
    void giveKeyboard();
    void addShortcuts();

    Screen& _screen;
    Settings _settings;
    TitleBar* _titleBar; // children
    PaneDeck* _deck;
    PlaybackBar* _playback;
    ToolbarWidget* _toolbar;
    SheetWidget* _sheet;
    AlertWidget* _alert;
};

} // namespace orvane
