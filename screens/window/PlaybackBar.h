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
class WrappedText;

// The controls of a recording. While the file is read: how much of it has been read, and a button
// that stops. After that: a slider for the position, a field that shows the time and takes another
// one, and buttons. Hidden without a recording.
class PlaybackBar final : public QWidget
{
public:
    // Controls the recording of the screen, which must outlive it.
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
    // Says that a typed text is not a time; hidden unless one was typed.
    [[nodiscard]] const WrappedText& refusal() const { return *_refusal; }

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
    void setRefused(bool isRefused);
    void jumpToSlider(int value);
    void showTime();
    void applyTheme();

    const Screen& _screen;
    TextLine* _remark; // children
    WrappedText* _refusal = nullptr;
    QProgressBar* _progress = nullptr;
    FlatButton* _stop = nullptr;
    QSlider* _slider = nullptr;
    QLineEdit* _time = nullptr;
    FlatButton* _play = nullptr;
    TextLine* _speed = nullptr;
    // Made last: they hold those above.
    QWidget* _reading;
    QWidget* _controls;
};

} // namespace orvane
