#include "screens/window/Drawing.h"

#include <QFontMetricsF>
#include <QPainter>
#include <QPainterPath>

#include <initializer_list>

namespace orvane
{

namespace
{

constexpr double kPenWidth = 1.8;

struct Shape {
    QPainterPath lines;
    QPainterPath areas;
};

QPainterPath polygon(std::initializer_list<QPointF> points, bool isClosed)
{
    QPainterPath path;
    for (const QPointF& point : points)
        if (path.elementCount() == 0)
            path.moveTo(point);
        else
            path.lineTo(point);
    if (isClosed)
        path.closeSubpath();
    return path;
}

// A triangle that points right, or left with a negative width.
QPainterPath triangle(double x, double width, double height)
{
    return polygon(
        {
            {x,         -height / 2},
            {x + width, 0          },
            {x,         height / 2 }
    },
        true);
}

QPainterPath bar(double x, double width, double height)
{
    QPainterPath path;
    path.addRect(x, -height / 2, width, height);
    return path;
}

// An arc around the middle, angles in degrees against the clock from three o'clock.
QPainterPath arc(const QPointF& middle, double radius, double from, double span)
{
    const QRectF around(middle.x() - radius, middle.y() - radius, 2 * radius, 2 * radius);
    QPainterPath path;
    path.arcMoveTo(around, from);
    path.arcTo(around, from, span);
    return path;
}

Shape signalShape()
{
    constexpr double kDot = 3;
    Shape shape;
    for (const double radius : {10.0, 18.0, 26.0}) {
        shape.lines.addPath(arc({0, 0}, radius, -45, 90));
        shape.lines.addPath(arc({0, 0}, radius, 135, 90));
    }
    shape.areas.addEllipse(QPointF(0, 0), kDot, kDot);
    return shape;
}

Shape cellShape()
{
    // A mast, its waves, and an arrow to the next one.
    Shape shape;
    shape.lines = polygon(
        {
            {-6, 8 },
            {-3, -2},
            {0,  8 }
    },
        false);
    shape.lines.addPath(arc({-3, -4}, 4.5, 120, 120));
    shape.lines.addPath(arc({-3, -4}, 4.5, -60, 120));
    shape.lines.addPath(polygon(
        {
            {5.5, -1 },
            {9,   2.5},
            {5.5, 6  }
    },
        false));
    shape.areas.addEllipse(QPointF(-3, -4), 1.5, 1.5);
    return shape;
}

Shape warningShape()
{
    Shape shape;
    shape.lines = polygon(
        {
            {0,  -7},
            {8,  7 },
            {-8, 7 }
    },
        true);
    shape.lines.addPath(polygon(
        {
            {0, -2},
            {0, 2 }
    },
        false));
    shape.areas.addEllipse(QPointF(0, 4.6), 0.9, 0.9);
    return shape;
}

Shape shapeOf(Sign sign)
{
    switch (sign) {
    case Sign::Back:
        return {
            polygon({{3.5, -7}, {-3.5, 0}, {3.5, 7}},
            false), {        }
        };
    case Sign::Disclosure:
        return {
            polygon({{-2.5, -5}, {2.5, 0}, {-2.5, 5}},
            false), {         }
        };
    case Sign::Checkmark:
        return {
            polygon({{-6, 0.5},  {-2, 4.5}, {6, -4.5}},
            false), {         }
        };
    case Sign::Signal:
        return signalShape();
    case Sign::Play:
        return {{}, triangle(-5, 13, 16)};
    case Sign::Pause:
        return {{}, bar(-6, 4, 14) + bar(2, 4, 14)};
    case Sign::Step:
        return {{}, triangle(-2, 8, 11) + bar(-7, 2.5, 11)};
    case Sign::StepBack:
        return {{}, triangle(2, -8, 11) + bar(4.5, 2.5, 11)};
    case Sign::Faster:
        return {{}, triangle(-8, 8, 11) + triangle(0, 8, 11)};
    case Sign::Slower:
        return {{}, triangle(8, -8, 11) + triangle(0, -8, 11)};
    case Sign::NextCell:
        return cellShape();
    case Sign::End:
        return {{}, triangle(-7, 10, 12) + bar(4.5, 2.5, 12)};
    case Sign::Stop:
        return {{}, bar(-5.5, 11, 11)};
    case Sign::Warning:
        return warningShape();
    }
    return {};
}

} // namespace

void drawSign(QPainter& painter, Sign sign, const QRectF& rect, const QColor& colour)
{
    const Shape shape = shapeOf(sign);
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(rect.center());
    painter.fillPath(shape.areas, colour);
    painter.setPen(QPen(colour, kPenWidth, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.setBrush(Qt::NoBrush);
    painter.drawPath(shape.lines);
    painter.restore();
}

void drawLine(QPainter& painter, const QRectF& rect, Qt::Alignment alignment, const QString& line)
{
    const QFontMetricsF metrics(painter.font());
    const int flags = static_cast<int>(alignment) | Qt::TextSingleLine | Qt::TextDontClip;
    painter.drawText(rect, flags, metrics.elidedText(line, Qt::ElideRight, rect.width() + 0.5));
}

void drawFocusRing(QPainter& painter, const QRectF& rect, double radius, const QColor& colour)
{
    constexpr double kRingWidth = 2;
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(colour, kRingWidth));
    painter.setBrush(Qt::NoBrush);
    const double inset = kRingWidth / 2 + 1;
    painter.drawRoundedRect(rect.adjusted(inset, inset, -inset, -inset), radius, radius);
    painter.restore();
}

} // namespace orvane
