#include "screens/window/BusyIndicator.h"

#include "screens/window/Theme.h"

#include <QElapsedTimer>
#include <QPainter>

#include <chrono>

namespace orvane
{

namespace
{

constexpr std::chrono::milliseconds kFrame{33};
constexpr double kTurnMs = 1000;
constexpr double kDegree = 16; // in Qt's unit of angles

// All indicators share one clock, so that a new one continues where the one before was.
double angleNow()
{
    static const QElapsedTimer clock = [] {
        QElapsedTimer timer;
        timer.start();
        return timer;
    }();
    return static_cast<double>(clock.elapsed() % static_cast<qint64>(kTurnMs)) / kTurnMs * 360;
}

} // namespace

BusyIndicator::BusyIndicator(QWidget* parent) : QWidget(parent)
{
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
    setAccessibleName(tr("Busy"));
    connect(&_timer, &QTimer::timeout, this, [this] { update(); });
}

void BusyIndicator::setTurning(bool isTurning)
{
    if (isTurning == _timer.isActive())
        return;
    if (isTurning)
        _timer.start(kFrame);
    else
        _timer.stop();
    update();
}

void BusyIndicator::paintEvent(QPaintEvent*)
{
    constexpr double kArc = 270;
    constexpr double kPen = 2;
    const Theme& theme = Theme::of(*this);
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(theme.quietText, kPen, Qt::SolidLine, Qt::RoundCap));
    const QRectF circle = QRectF(rect()).adjusted(3, 3, -3, -3);
    const double start = isTurning() ? -angleNow() : 0;
    painter.drawArc(circle, static_cast<int>(start * kDegree), static_cast<int>(kArc * kDegree));
}

} // namespace orvane
