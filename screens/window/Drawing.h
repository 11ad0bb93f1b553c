#pragma once

#include <QColor>
#include <QRectF>
#include <QString>

class QPainter;

namespace orvane
{

// The signs of the window. They are drawn as lines and areas, and are sharp at every scale.
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

// Draws the sign in the middle of the rectangle, at its own size of about 16 to 20 points.
void drawSign(QPainter& painter, Sign sign, const QRectF& rect, const QColor& colour);

// Draws one line of text, cut with an ellipsis if it is wider than the rectangle.
void drawLine(QPainter& painter, const QRectF& rect, Qt::Alignment alignment, const QString& line);

// Draws the ring around the element that has the keyboard.
void drawFocusRing(QPainter& painter, const QRectF& rect, double radius, const QColor& colour);

} // namespace orvane
