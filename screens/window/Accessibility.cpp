#include "screens/window/Accessibility.h"

#include "screens/window/RowWidget.h"
#include "screens/window/TableWidget.h"

#include <QAccessibleWidget>

namespace orvane
{

namespace
{

TableWidget* tableOf(const RowWidget& row)
{
    return dynamic_cast<TableWidget*>(row.parentWidget());
}

// A row that leads on is a button; any other is read only.
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

QAccessibleInterface* makeInterface(const QString&, QObject* object)
{
    if (auto* row = dynamic_cast<RowWidget*>(object))
        return new AccessibleRow(row);
    if (auto* table = dynamic_cast<TableWidget*>(object))
        return new AccessibleTable(table);
    return nullptr;
}

} // namespace

void installAccessibility() { QAccessible::installFactory(makeInterface); }

} // namespace orvane
