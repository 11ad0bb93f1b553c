#pragma once

#include <QColor>
#include <QRectF>
#include <QString>

class QPainter;

namespace orvane
{

// The signs of the window, drawn as lines, so that they are sharp at every scale.
enum class Sign {
    Back,
    Disclosure,
    Checkmark,
    Signal,
    Play,
    Pause,
    Step,
    StepBack,
    Faster,
    Slower,
    NextCell,
    End,
    Stop,
    Warning
};

// In the middle of the rectangle, at its own size of about 16 to 20 points.
void drawSign(QPainter& painter, Sign sign, const QRectF& rect, const QColor& colour);

// One line of text, cut with an ellipsis where it is wider than the rectangle.
void drawLine(QPainter& painter, const QRectF& rect, Qt::Alignment alignment, const QString& line);

// The ring around what has the keyboard.
void drawFocusRing(QPainter& painter, const QRectF& rect, double radius, const QColor& colour);

} // namespace orvane
