#include "screens/window/Accessibility.h"

#include "screens/window/AlertWidget.h"
#include "screens/window/BusyIndicator.h"
#include "screens/window/EmptyView.h"
#include "screens/window/PaneDeck.h"
#include "screens/window/PaneWidget.h"
#include "screens/window/PlaybackBar.h"
#include "screens/window/RowWidget.h"
#include "screens/window/SheetWidget.h"
#include "screens/window/TableWidget.h"
#include "screens/window/TextLine.h"
#include "screens/window/TitleBar.h"
#include "screens/window/ToolbarWidget.h"
#include "screens/window/WindowFrame.h"

#include <QAccessibleWidget>

#include <optional>

namespace orvane
{

namespace
{

TableWidget* tableOf(const RowWidget& row)
{
    return dynamic_cast<TableWidget*>(row.parentWidget());
}

// A row that opens another pane is a button; any other row is an item that can be read.
class AccessibleRow final : public QAccessibleWidget
{
public:
    explicit AccessibleRow(RowWidget* row) : QAccessibleWidget(row), _row(*row) {}

    [[nodiscard]] QAccessible::Role role() const override
    {
        return leadsOn() ? QAccessible::Button : QAccessible::ListItem;
    }
    [[nodiscard]] QAccessible::State state() const override
    {
        QAccessible::State state = QAccessibleWidget::state();
        const TableWidget* table = tableOf(_row);
        state.focusable = true;
        state.focused = table && table->hasFocus() && table->currentRow() == _row.row();
        return state;
    }
    [[nodiscard]] QStringList actionNames() const override
    {
        QStringList names = QAccessibleWidget::actionNames();
        if (leadsOn())
            names.prepend(pressAction());
        return names;
    }
    void doAction(const QString& name) override
    {
        TableWidget* table = tableOf(_row);
        if (name == pressAction() && table)
            table->pressRow(_row.row());
        else
            QAccessibleWidget::doAction(name);
    }

private:
    [[nodiscard]] bool leadsOn() const
    {
        return _row.content().accessory == CellAccessory::DisclosureIndicator;
    }

    RowWidget& _row;
};

class AccessibleTable final : public QAccessibleWidget
{
public:
    explicit AccessibleTable(TableWidget* table)
        : QAccessibleWidget(table, QAccessible::List), _table(*table)
    {
    }

    [[nodiscard]] QAccessibleInterface* focusChild() const override
    {
        RowWidget* row = _table.hasFocus() ? _table.rowWidget(_table.currentRow()) : nullptr;
        return row ? QAccessible::queryAccessibleInterface(row) : QAccessibleWidget::focusChild();
    }

private:
    TableWidget& _table;
};

template <typename Widget>
bool is(const QObject* object)
{
    return dynamic_cast<const Widget*>(object) != nullptr;
}

// The role of a widget whose name and state are as QWidget has them; nullopt for widgets that Qt
// knows itself.
std::optional<QAccessible::Role> roleOf(const QObject* object)
{
    if (is<TextLine>(object) || is<EmptyView>(object))
        return QAccessible::StaticText;
    if (is<WindowFrame>(object))
        return QAccessible::Window;
    if (is<TitleBar>(object))
        return QAccessible::TitleBar;
    if (is<ToolbarWidget>(object) || is<PlaybackBar>(object))
        return QAccessible::ToolBar;
    if (is<BusyIndicator>(object))
        return QAccessible::Animation;
    if (is<AlertWidget>(object))
        return QAccessible::AlertMessage;
    if (is<SheetWidget>(object))
        return QAccessible::Dialog;
    if (is<PaneDeck>(object) || is<PaneWidget>(object))
        return QAccessible::Pane;
    return std::nullopt;
}

QAccessibleInterface* makeInterface(const QString& className, QObject* object)
{
    if (auto* row = dynamic_cast<RowWidget*>(object))
        return new AccessibleRow(row);
    if (auto* table = dynamic_cast<TableWidget*>(object))
        return new AccessibleTable(table);
    auto* widget = qobject_cast<QWidget*>(object);
    if (!widget)
        return nullptr;
    if (const auto role = roleOf(object))
        return new QAccessibleWidget(widget, *role);
    // A widget that only holds others. A window has its own role.
    if (className == QLatin1String("QWidget") &&
        QLatin1String(object->metaObject()->className()) == className && !widget->isWindow())
        return new QAccessibleWidget(widget, QAccessible::Grouping);
    return nullptr;
}

} // namespace

void installAccessibility() { QAccessible::installFactory(makeInterface); }

} // namespace orvane
