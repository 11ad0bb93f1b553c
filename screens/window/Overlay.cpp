#include "screens/window/Overlay.h"

#include "screens/window/Theme.h"

#include <QEvent>
#include <QLineEdit>
#include <QMouseEvent>
#include <QPainter>
#include <QWheelEvent>

namespace orvane
{

Overlay::Overlay(QWidget* parent) : QWidget(parent), _card(new QWidget(this))
{
    hide();
    setFocusPolicy(Qt::NoFocus);
    parent->installEventFilter(this);
}

bool Overlay::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == parentWidget() && event->type() == QEvent::Resize)
        setGeometry(parentWidget()->rect());
    return false;
}

void Overlay::placeCard()
{
    _card->setGeometry(cardPlace(size()));
    update();
}

bool Overlay::focusNextPrevChild(bool isNext)
{
    // Tab stays within the card.
    if (QWidget* next = partAfter(focusWidget() ? focusWidget() : _card, isNext)) {
        next->clearFocus(); // it may be the only part: the reason must reach it all the same
        next->setFocus(isNext ? Qt::TabFocusReason : Qt::BacktabFocusReason);
    }
    return true;
}

QWidget* Overlay::partAfter(QWidget* start, bool isNext) const
{
    QWidget* next = start;
    do {
        next = isNext ? next->nextInFocusChain() : next->previousInFocusChain();
        const bool takesFocus = (next->focusPolicy() & Qt::TabFocus) != 0;
        if (takesFocus && next->isEnabled() && next->isVisible() && _card->isAncestorOf(next))
            return next;
    } while (next != start);
    return nullptr;
}

void Overlay::takeKeyboard()
{
    QWidget* const field = _card->findChild<QLineEdit*>();
    if (QWidget* first = field ? field : partAfter(_card, true))
        first->setFocus(_keyboard.isUnderWay() ? Qt::TabFocusReason : Qt::OtherFocusReason);
}

void Overlay::showEvent(QShowEvent*)
{
    setGeometry(parentWidget()->rect());
    raise();
    placeCard();
}

void Overlay::resizeEvent(QResizeEvent*) { placeCard(); }

void Overlay::paintEvent(QPaintEvent*)
{
    constexpr double kRadius = 14;
    const Theme& theme = Theme::of(*this);
    QPainter painter(this);
    painter.fillRect(rect(), theme.shade);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(theme.background);
    painter.drawRoundedRect(_card->geometry(), kRadius, kRadius);
}

void Overlay::mousePressEvent(QMouseEvent* event)
{
    // Presses on an empty part of the card arrive here too. The window handles the back button.
    event->setAccepted(event->button() != Qt::BackButton);
    if (event->button() == Qt::LeftButton)
        pressBackground();
}

void Overlay::wheelEvent(QWheelEvent* event) { event->accept(); }

} // namespace orvane
