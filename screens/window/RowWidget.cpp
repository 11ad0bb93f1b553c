#include "screens/window/RowWidget.h"

#include "screens/window/Drawing.h"
#include "screens/window/Theme.h"

#include <QFontMetricsF>
#include <QLinearGradient>
#include <QPainter>

#include <utility>

namespace orvane
{

namespace
{

constexpr double kFade = 24; // width of the fade at the edge of a text that goes on

void drawLabels(QPainter& painter, const std::vector<DrawnLabel>& labels)
{
    for (const DrawnLabel& label : labels) {
        painter.setFont(label.font);
        if (label.isWrapped)
            painter.drawText(label.frame, static_cast<int>(label.alignment) | Qt::TextWordWrap,
                             label.text);
        else
            drawLine(painter, label.frame, label.alignment, label.text);
    }
}

// Fades the rectangle into the background, towards its right or left end.
void fade(QPainter& painter, const QRectF& rect, const QColor& background, bool isToTheRight)
{
    QColor clear = background;
    clear.setAlpha(0);
    QLinearGradient gradient(rect.topLeft(), rect.topRight());
    gradient.setColorAt(isToTheRight ? 0 : 1, clear);
    gradient.setColorAt(isToTheRight ? 1 : 0, background);
    painter.fillRect(rect, gradient);
}

} // namespace

RowWidget::RowWidget(QWidget* table) : QWidget(table)
{
    setAttribute(Qt::WA_TransparentForMouseEvents);
    setAttribute(Qt::WA_OpaquePaintEvent);
}

void RowWidget::setContent(DrawnRow content)
{
    if (content == _content)
        return;
    _content = std::move(content);
    setAccessibleName(_content.spokenText());
    update();
}

void RowWidget::setSideways(double offset)
{
    if (_sideways == offset)
        return;
    _sideways = offset;
    update();
}

void RowWidget::setPressed(bool isPressed)
{
    if (_isPressed == isPressed)
        return;
    _isPressed = isPressed;
    update();
}

void RowWidget::setRing(bool hasRing)
{
    if (_hasRing == hasRing)
        return;
    _hasRing = hasRing;
    update();
}

void RowWidget::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::of(*this);
    QPainter painter(this);
    const QColor& background = _isPressed ? theme.pressed : theme.background;
    painter.fillRect(rect(), background);
    painter.fillRect(QRectF(TableViewCell::kMargin, height() - 1, width(), 1), theme.line);

    painter.setPen(theme.text);
    drawLabels(painter, _content.labels);
    for (const DrawnStrip& strip : _content.strips)
        drawStrip(painter, strip, background);

    const QRectF accessory(width() - TableViewCell::kAccessoryWidth, 0,
                           TableViewCell::kAccessoryWidth, height());
    if (_content.accessory == CellAccessory::DisclosureIndicator)
        drawSign(painter, Sign::Disclosure, accessory, theme.quietText);
    if (_content.accessory == CellAccessory::Checkmark)
        drawSign(painter, Sign::Checkmark, accessory, theme.accent);
    if (_hasRing)
        drawFocusRing(painter, rect(), 6, theme.accent);
}

void RowWidget::drawStrip(QPainter& painter, const DrawnStrip& strip,
                          const QColor& background) const
{
    const QRectF shown = strip.frame.intersected(QRectF(0, 0, width(), height() - 1));
    painter.save();
    painter.setClipRect(shown);
    painter.translate(strip.frame.left() - _sideways, strip.frame.top());
    drawLabels(painter, strip.labels);
    painter.restore();

    double end = 0;
    for (const DrawnLabel& label : strip.labels)
        end = std::max(end, label.frame.right());
    if (end - _sideways > strip.frame.width() + 1)
        fade(painter, {shown.right() - kFade, shown.top(), kFade, shown.height()}, background,
             true);
    if (_sideways > 0)
        fade(painter, {shown.left(), shown.top(), kFade, shown.height()}, background, false);
}

} // namespace orvane
