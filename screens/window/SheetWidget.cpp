#include "screens/window/SheetWidget.h"

#include "screens/window/Theme.h"
#include "screens/window/UiInterface.h"

#include <QEvent>
#include <QVBoxLayout>

#include <algorithm>

namespace orvane
{

SheetWidget::SheetWidget(QWidget* parent) : Overlay(parent)
{
    auto* column = new QVBoxLayout(&card());
    column->setContentsMargins(0, 4, 0, 12);
    applyTheme();
}

void SheetWidget::sync(UiInterface* interface)
{
    if (interface == _interface) {
        if (_interface)
            _interface->sync();
        return;
    }
    if (_interface) {
        card().layout()->removeWidget(&_interface->widget());
        _interface->widget().setParent(nullptr);
    }
    _interface = interface;
    setVisible(_interface != nullptr);
    if (!_interface)
        return;
    QWidget& shown = _interface->widget();
    card().layout()->addWidget(&shown);
    setAccessibleName(shown.windowTitle());
    shown.show();
    placeCard();
    _interface->sync();
    takeKeyboard();
}

QRect SheetWidget::cardPlace(const QSize& size) const
{
    constexpr int kWideWindow = 560;
    constexpr QSize kCard(440, 520);
    constexpr int kTop = 24;
    if (size.width() < kWideWindow) {
        // The lower corners are beyond the edge.
        constexpr int kBelow = 16;
        const int top = size.height() > kCard.height() ? kTop : 0;
        return {0, top, size.width(), size.height() - top + kBelow};
    }
    const int height = std::min(kCard.height(), size.height() - 2 * kTop);
    return {(size.width() - kCard.width()) / 2, (size.height() - height) / 2, kCard.width(),
            height};
}

void SheetWidget::pressBackground()
{
    if (_interface)
        _interface->pressBackground();
}

void SheetWidget::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::PaletteChange)
        applyTheme();
    Overlay::changeEvent(event);
}

void SheetWidget::applyTheme()
{
    const Theme& theme = Theme::of(*this);
    const QString style =
        QStringLiteral("QLineEdit { background: %1; color: %2; border: 1px solid %3;"
                       " border-radius: 8px; padding: 0 12px; }"
                       "QLineEdit:focus { border: 2px solid %4; padding: 0 11px; }"
                       "QLabel { color: %2; }"
                       "QLabel#captionLabel { color: %5; }")
            .arg(theme.background.name(), theme.text.name(), theme.line.name(), theme.accent.name(),
                 theme.quietText.name());
    if (card().styleSheet() != style)
        card().setStyleSheet(style);
}

} // namespace orvane
