#include "screens/window/AlertWidget.h"

#include "screens/toolkit/AlertView.h"
#include "screens/window/FlatButton.h"
#include "screens/window/PlainText.h"
#include "screens/window/WrappedText.h"

#include <QVBoxLayout>

#include <algorithm>
#include <utility>

namespace orvane
{

AlertWidget::AlertWidget(QWidget* parent, std::function<void()> dismiss)
    : Overlay(parent), _title(new WrappedText(&card(), Font::boldSystem(17))),
      _message(new WrappedText(&card(), Font::system(15))), _button(new FlatButton(&card()))
{
    auto* column = new QVBoxLayout(&card());
    column->setContentsMargins(20, 24, 20, 10);
    column->setSpacing(8);
    column->addWidget(_title);
    column->addWidget(_message);
    column->addWidget(_button);
    _button->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
    connect(_button, &QAbstractButton::clicked, this,
            [dismiss = std::move(dismiss)] { dismiss(); });
}

void AlertWidget::sync(const AlertView* alert)
{
    if (!alert)
        return hide();
    _title->setText(lineOf(alert->title()));
    _message->setText(lineOf(alert->message()));
    _button->setText(lineOf(alert->buttonTitle()));
    setAccessibleName(_title->text());
    setAccessibleDescription(_message->text());
    if (isVisible())
        return placeCard();
    show();
    raise();
    takeKeyboard();
}

QRect AlertWidget::cardPlace(const QSize& size) const
{
    constexpr int kWidest = 320;
    constexpr int kMargin = 24;
    const int width = std::min(kWidest, size.width() - 2 * kMargin);
    const int height = card().layout()->heightForWidth(width);
    return {(size.width() - width) / 2, (size.height() - height) / 2, width, height};
}

} // namespace orvane
