#include "screens/window/FlatButton.h"

#include "screens/window/Fonts.h"
#include "screens/window/PlainText.h"
#include "screens/window/Theme.h"

#include <QFocusEvent>
#include <QKeyEvent>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace orvane
{

namespace
{

constexpr double kTextSize = 15;
constexpr int kMargin = 12;
constexpr int kSignWidth = 22; // of a sign that a text follows

// Nullopt for all keys but Return and Enter.
std::optional<QKeyEvent> spaceFor(const QKeyEvent& event)
{
    if (event.key() != Qt::Key_Return && event.key() != Qt::Key_Enter)
        return std::nullopt;
    return std::optional<QKeyEvent>(std::in_place, event.type(), Qt::Key_Space, event.modifiers(),
                                    QString(), event.isAutoRepeat());
}

} // namespace

FlatButton::FlatButton(QWidget* parent) : QAbstractButton(parent)
{
    setFocusPolicy(Qt::TabFocus);
    setAttribute(Qt::WA_Hover);
    setFont(fontFor(Font::system(kTextSize)));
    setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
}

void FlatButton::setSign(Sign sign)
{
    if (_sign == sign)
        return;
    _sign = sign;
    updateGeometry();
    update();
}

void FlatButton::setText(const QString& text)
{
    if (this->text() == text)
        return;
    QAbstractButton::setText(text);
    setShortcut({});
    setAccessibleName(text);
    updateGeometry();
}

void FlatButton::setName(const QString& name)
{
    if (accessibleName() == name)
        return;
    setAccessibleName(name);
    setPlainToolTip(*this, name);
}

QSize FlatButton::sizeHint() const
{
    if (text().isEmpty())
        return {kSize, kSize};
    const int sign = _sign ? kSignWidth : kMargin;
    const int wide = static_cast<int>(std::ceil(sizeOfLine(text(), font()).width()));
    return {std::max(kSize, sign + wide + kMargin), kSize};
}

void FlatButton::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::of(*this);
    QPainter painter(this);
    if (isDown() || (underMouse() && isEnabled())) {
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(Qt::NoPen);
        painter.setBrush(isDown() ? theme.pressed : theme.badge);
        painter.drawRoundedRect(QRectF(rect()).adjusted(3, 5, -3, -5), 8, 8);
    }
    const QColor& colour = isEnabled() ? theme.accent : theme.disabled;
    QRectF place = rect();
    if (_sign && !text().isEmpty()) {
        drawSign(painter, *_sign, {4, 0, kSignWidth - 6, place.height()}, colour);
        place.setLeft(kSignWidth);
    } else if (_sign)
        drawSign(painter, *_sign, place, colour);
    painter.setPen(colour);
    painter.setFont(font());
    drawLine(painter, place, _sign ? Qt::AlignLeft | Qt::AlignVCenter : Qt::AlignCenter, text());
    if (hasFocus() && _hasRing)
        drawFocusRing(painter, rect(), 8, theme.accent);
}

void FlatButton::focusInEvent(QFocusEvent* event)
{
    _hasRing = event->reason() == Qt::TabFocusReason || event->reason() == Qt::BacktabFocusReason;
    QAbstractButton::focusInEvent(event);
}

void FlatButton::keyPressEvent(QKeyEvent* event)
{
    auto space = spaceFor(*event);
    QAbstractButton::keyPressEvent(space ? &*space : event);
}

void FlatButton::keyReleaseEvent(QKeyEvent* event)
{
    auto space = spaceFor(*event);
    QAbstractButton::keyReleaseEvent(space ? &*space : event); // may destroy this
}

} // namespace orvane
