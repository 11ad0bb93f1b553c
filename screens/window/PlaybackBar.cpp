#include "screens/window/PlaybackBar.h"

#include "screens/toolkit/Playback.h"
#include "screens/toolkit/Screen.h"
#include "screens/window/FlatButton.h"
#include "screens/window/Fonts.h"
#include "screens/window/PlainText.h"
#include "screens/window/TextLine.h"
#include "screens/window/Theme.h"
#include "screens/window/WrappedText.h"

#include <QAccessible>
#include <QEvent>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QPainter>
#include <QProgressBar>
#include <QSignalBlocker>
#include <QSlider>
#include <QVBoxLayout>

#include <algorithm>
#include <cmath>

namespace orvane
{

namespace
{

constexpr int kSliderSteps = 10000;
constexpr int kProgressSteps = 1000;
constexpr double kTextSize = 13;

QString controlStyle(const Theme& theme)
{
    return QStringLiteral(
               "QSlider { background: transparent; }"
               "QSlider::groove:horizontal { height: 4px; border-radius: 2px; background: %1; }"
               "QSlider::sub-page:horizontal { border-radius: 2px; background: %2; }"
               "QSlider::handle:horizontal { width: 18px; margin: -7px 0; border-radius: 9px;"
               " background: %2; }"
               "QSlider::handle:horizontal:focus { border: 3px solid %5; }"
               "QProgressBar { border: none; border-radius: 2px; background: %1; }"
               "QProgressBar::chunk { border-radius: 2px; background: %2; }"
               "QLineEdit { border: 1px solid %1; border-radius: 8px; padding: 0 6px;"
               " background: %3; color: %4; }"
               "QLineEdit:focus { border: 2px solid %2; padding: 0 5px; }"
               "QLineEdit[isWrong=\"true\"] { border: 2px solid %6; padding: 0 5px; }")
        .arg(theme.line.name(), theme.accent.name(), theme.background.name(), theme.text.name(),
             theme.text.name(), theme.warning.name());
}

} // namespace

PlaybackBar::PlaybackBar(QWidget* parent, const Screen& screen)
    : QWidget(parent), _screen(screen), _remark(new TextLine(this)), _reading(makeReading()),
      _controls(makeControls())
{
    hide();
    setAccessibleName(tr("Playback"));
    _remark->setLineFont(fontFor(Font::system(kTextSize)));
    _remark->setQuiet(true);
    _remark->setFixedHeight(26);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(4, 1, 4, 0);
    column->setSpacing(0);
    auto* remarkRow = new QHBoxLayout;
    remarkRow->setContentsMargins(8, 0, 8, 0);
    remarkRow->addWidget(_remark);
    column->addLayout(remarkRow);
    column->addWidget(_reading);
    column->addWidget(_controls);
    applyTheme();
}

QWidget* PlaybackBar::makeReading()
{
    auto* reading = new QWidget(this);
    auto* row = new QHBoxLayout(reading);
    row->setContentsMargins(4, 0, 0, 0);
    auto* word = new TextLine(reading);
    word->setLineFont(fontFor(Font::system(kTextSize)));
    word->setText(tr("Reading"));
    _progress = new QProgressBar(reading);
    _progress->setRange(0, kProgressSteps);
    _progress->setTextVisible(false);
    _progress->setFixedHeight(6);
    _progress->setAccessibleName(tr("Reading the recording"));
    _stop = makeButton(reading, Sign::Stop, tr("Stop reading"), &Playback::stopReading);
    row->addWidget(word);
    row->addWidget(_progress, 1);
    row->addWidget(_stop);
    return reading;
}

QWidget* PlaybackBar::makeControls()
{
    auto* controls = new QWidget(this);
    _slider = new QSlider(Qt::Horizontal, controls);
    _slider->setRange(0, kSliderSteps);
    _slider->setFixedHeight(FlatButton::kSize);
    _slider->setAccessibleName(tr("Position"));
    connect(_slider, &QSlider::valueChanged, this, [this](int value) { jumpToSlider(value); });

    _time = new QLineEdit(controls);
    _time->setFont(fontFor(Font::system(kTextSize)));
    _time->setFixedSize(184, 34);
    _time->setAlignment(Qt::AlignCenter);
    _time->setPlaceholderText(tr("10:04:30 or +90"));
    _time->setAccessibleName(tr("Time of the recording; type another to jump there"));
    setPlainToolTip(*_time,
                    tr("Type a time to jump there: 10:04:30, or +90 seconds from the start"));
    _time->installEventFilter(this);
    connect(_time, &QLineEdit::returnPressed, this, [this] { jumpToTyped(); });
    connect(_time, &QLineEdit::textEdited, this, [this] { setRefused(false); });

    auto* upper = new QHBoxLayout;
    upper->setContentsMargins(10, 0, 6, 0);
    upper->setSpacing(10);
    upper->addWidget(_slider, 1);
    upper->addWidget(_time);

    _refusal = new WrappedText(controls, Font::system(kTextSize), WrappedText::Tone::Warning);
    _refusal->setText(tr("Not a time. Type 10:04:30, or +90 for 90 seconds from the start."));
    _refusal->hide();

    auto* lower = new QHBoxLayout;
    lower->setSpacing(0);
    const auto add = [&](Sign sign, const QString& name, void (Playback::*action)()) {
        lower->addWidget(makeButton(controls, sign, name, action));
    };
    add(Sign::StepBack, tr("Step back"), &Playback::stepBack);
    _play = makeButton(controls, Sign::Play, tr("Play"), &Playback::play);
    lower->addWidget(_play);
    add(Sign::Step, tr("Step"), &Playback::step);
    lower->addStretch(1);
    add(Sign::Slower, tr("Slower"), &Playback::slower);
    _speed = new TextLine(controls);
    _speed->setLineFont(fontFor(Font::system(kTextSize)));
    _speed->setAlignment(Qt::AlignCenter);
    _speed->setFixedWidth(FlatButton::kSize);
    lower->addWidget(_speed);
    add(Sign::Faster, tr("Faster"), &Playback::faster);
    lower->addStretch(1);
    add(Sign::NextCell, tr("To the next serving cell"), &Playback::jumpToNextServingCell);
    add(Sign::End, tr("To the end"), &Playback::jumpToEnd);

    auto* column = new QVBoxLayout(controls);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addLayout(upper);
    column->addWidget(_refusal);
    column->addLayout(lower);
    return controls;
}

FlatButton* PlaybackBar::makeButton(QWidget* parent, Sign sign, const QString& name,
                                    void (Playback::*action)())
{
    auto* button = new FlatButton(parent);
    button->setSign(sign);
    button->setName(name);
    connect(button, &QAbstractButton::clicked, this, [this, button, action] {
        Playback* playback = _screen.playback();
        if (!playback)
            return;
        if (button == _play && playback->isPlaying())
            playback->pause();
        else
            (playback->*action)();
    });
    return button;
}

void PlaybackBar::sync()
{
    const Playback* playback = _screen.playback();
    setVisible(playback != nullptr);
    if (!playback)
        return;
    const QString remark = lineOf(playback->remark());
    _remark->setText(remark);
    setPlainToolTip(*_remark, remark);
    _remark->setVisible(!remark.isEmpty());
    const double progress = playback->progress();
    _reading->setVisible(progress < 1);
    _controls->setVisible(progress >= 1);
    if (progress < 1)
        return _progress->setValue(static_cast<int>(progress * kProgressSteps));

    _play->setSign(playback->isPlaying() ? Sign::Pause : Sign::Play);
    _play->setName(playback->isPlaying() ? tr("Pause") : tr("Play"));
    _speed->setText(QString::number(playback->speed()) + QChar(0xD7));
    setPlainToolTip(*_speed, tr("Seconds of the recording a second"));
    showTime();
    if (_slider->isSliderDown())
        return;
    const QSignalBlocker block(_slider);
    const double duration = playback->duration();
    const double part = duration > 0 ? playback->position() / duration : 0;
    _slider->setValue(static_cast<int>(std::lround(std::clamp(part, 0.0, 1.0) * kSliderSteps)));
}

void PlaybackBar::showTime()
{
    // Not while somebody types another time.
    const Playback* playback = _screen.playback();
    const QString time = playback ? lineOf(playback->positionText()) : QString();
    if (!_time->hasFocus() && _time->text() != time)
        _time->setText(time);
}

void PlaybackBar::jumpToTyped()
{
    Playback* playback = _screen.playback();
    const bool isUsable = playback && playback->jumpToText(_time->text().toStdString());
    setRefused(!isUsable);
    if (isUsable)
        _time->clearFocus();
}

void PlaybackBar::setRefused(bool isRefused)
{
    if (_refusal->isHidden() != isRefused)
        return;
    _time->setProperty("isWrong", isRefused);
    _refusal->setVisible(isRefused);
    applyTheme();
    if (!isRefused)
        return;
    QAccessibleEvent alert(_refusal, QAccessible::Alert);
    QAccessible::updateAccessibility(&alert);
}

void PlaybackBar::jumpToSlider(int value)
{
    if (Playback* playback = _screen.playback())
        playback->jumpTo(playback->duration() * value / kSliderSteps);
}

bool PlaybackBar::eventFilter(QObject*, QEvent* event)
{
    // The field shows the time. When it gets the keyboard it is emptied for another one.
    if (event->type() == QEvent::FocusIn)
        _time->clear();
    if (event->type() == QEvent::FocusOut) {
        setRefused(false);
        showTime();
    }
    return false;
}

void PlaybackBar::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::PaletteChange)
        applyTheme();
    QWidget::changeEvent(event);
}

void PlaybackBar::applyTheme()
{
    // A style sheet that is set again also looks at the field's property again.
    for (QWidget* part : {_reading, _controls})
        part->setStyleSheet(controlStyle(Theme::of(*this)));
}

void PlaybackBar::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::of(*this);
    QPainter painter(this);
    painter.fillRect(rect(), theme.bar);
    painter.fillRect(0, 0, width(), 1, theme.line);
}

} // namespace orvane
