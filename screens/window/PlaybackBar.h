#pragma once

#include "screens/window/Drawing.h"

#include <QWidget>

class QLineEdit;
class QProgressBar;
class QSlider;

namespace orvane
{

class FlatButton;
class Playback;
class Screen;
class TextLine;

// The controls of a recording: while it is read, how far that is and a button that stops it; then
// the position, the time (where one can type another), and buttons. Hidden without a recording.
class PlaybackBar final : public QWidget
{
public:
    // For the recording of the screen, which must outlive it.
    PlaybackBar(QWidget* parent, const Screen& screen);

    // Shows the recording as it is now; touches only what has changed.
    void sync();

    [[nodiscard]] QSlider& slider() const { return *_slider; }
    [[nodiscard]] QLineEdit& timeField() const { return *_time; }
    [[nodiscard]] QProgressBar& progress() const { return *_progress; }
    [[nodiscard]] FlatButton& playButton() const { return *_play; }
    [[nodiscard]] FlatButton& stopButton() const { return *_stop; }
    [[nodiscard]] const TextLine& speed() const { return *_speed; }
    [[nodiscard]] const TextLine& remark() const { return *_remark; }

protected:
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QWidget* makeReading();
    QWidget* makeControls();
    FlatButton* makeButton(QWidget* parent, Sign sign, const QString& name,
                           void (Playback::*action)());
    void jumpToTyped();
    void jumpToSlider(int value);
    void showTime();
    void applyTheme();

    const Screen& _screen;
    TextLine* _remark; // children
    QProgressBar* _progress = nullptr;
    FlatButton* _stop = nullptr;
    QSlider* _slider = nullptr;
    QLineEdit* _time = nullptr;
    FlatButton* _play = nullptr;
    TextLine* _speed = nullptr;
    // Made last, of those above.
    QWidget* _reading;
    QWidget* _controls;
};

} // namespace orvane
