#include "screens/window/ToolbarWidget.h"

#include "screens/toolkit/ActivityIndicator.h"
#include "screens/toolkit/Label.h"
#include "screens/window/BusyIndicator.h"
#include "screens/window/FlatButton.h"
#include "screens/window/Fonts.h"
#include "screens/window/PlainText.h"
#include "screens/window/TextLine.h"
#include "screens/window/Theme.h"

#include <QHBoxLayout>
#include <QPainter>

#include <algorithm>
#include <utility>

namespace orvane
{

ToolbarWidget::ToolbarWidget(QWidget* parent, std::function<void(std::size_t)> press)
    : QWidget(parent), _press(std::move(press)), _layout(new QHBoxLayout(this))
{
    setFixedHeight(FlatButton::kSize);
    setAccessibleName(tr("Status"));
    _layout->setContentsMargins(12, 0, 4, 0);
    _layout->setSpacing(8);
}

ToolbarWidget::Kind ToolbarWidget::kindOf(const BarButtonItem* item)
{
    if (!item)
        return Kind::Other;
    switch (item->kind()) {
    case BarButtonItem::Kind::FlexibleSpace:
        return Kind::Space;
    case BarButtonItem::Kind::Save:
        return Kind::Save;
    case BarButtonItem::Kind::CustomView:
        break;
    }
    const View* view = item->customView().get();
    if (dynamic_cast<const ActivityIndicator*>(view))
        return Kind::Busy;
    return dynamic_cast<const Label*>(view) ? Kind::Text : Kind::Other;
}

void ToolbarWidget::sync(const ViewController::ToolbarItems& items)
{
    std::vector<Kind> kinds;
    for (const auto& item : items)
        kinds.push_back(kindOf(item.get()));
    const auto isSameKind = [](const Item& item, Kind kind) { return item.kind == kind; };
    if (!std::equal(_items.begin(), _items.end(), kinds.begin(), kinds.end(), isSameKind))
        rebuild(kinds);
    for (std::size_t i = 0; i < items.size(); ++i)
        if (_items[i].widget && items[i]->customView())
            update(_items[i], *items[i]->customView());
}

void ToolbarWidget::update(const Item& item, View& view)
{
    item.widget->setVisible(!view.isHidden());
    if (item.kind == Kind::Busy) {
        const bool isAnimating = static_cast<ActivityIndicator&>(view).isAnimating();
        static_cast<BusyIndicator*>(item.widget)->setTurning(isAnimating);
    } else if (item.kind == Kind::Text) {
        auto* line = static_cast<TextLine*>(item.widget);
        const auto& label = static_cast<Label&>(view);
        line->setLineFont(fontFor(label.font()));
        line->setText(lineOf(label.text()));
    }
}

void ToolbarWidget::rebuild(const std::vector<Kind>& kinds)
{
    while (QLayoutItem* old = _layout->takeAt(0)) {
        delete old->widget();
        delete old;
    }
    _items.clear();
    for (const Kind kind : kinds) {
        QWidget* widget = makeWidget(kind, _items.size());
        if (widget)
            _layout->addWidget(widget);
        else if (kind == Kind::Space)
            _layout->addStretch(1);
        _items.push_back({kind, widget});
    }
}

QWidget* ToolbarWidget::makeWidget(Kind kind, std::size_t index)
{
    switch (kind) {
    case Kind::Busy:
        return new BusyIndicator(this);
    case Kind::Text: {
        auto* line = new TextLine(this);
        line->setQuiet(true);
        return line;
    }
    case Kind::Save: {
        auto* button = new FlatButton(this);
        button->setText(tr("Save"));
        connect(button, &QAbstractButton::clicked, this, [this, index] { _press(index); });
        return button;
    }
    case Kind::Space:
    case Kind::Other:
        break;
    }
    return nullptr;
}

QWidget* ToolbarWidget::itemWidget(std::size_t index) const
{
    return index < _items.size() ? _items[index].widget : nullptr;
}

void ToolbarWidget::paintEvent(QPaintEvent*)
{
    const Theme& theme = Theme::of(*this);
    QPainter painter(this);
    painter.fillRect(rect(), theme.bar);
    painter.fillRect(0, 0, width(), 1, theme.line);
}

} // namespace orvane
