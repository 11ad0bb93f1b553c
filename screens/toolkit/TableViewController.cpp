#include "screens/toolkit/TableViewController.h"

#include "screens/toolkit/Screen.h"

#include <utility>

namespace orvane
{

TableViewController::~TableViewController()
{
    // The table may outlive this controller and must not call it then.
    if (_table) {
        _table->setDataSource(nullptr);
        _table->setDelegate(nullptr);
    }
}

TableView& TableViewController::tableView()
{
    if (!_table) {
        _table = std::make_shared<TableView>();
        _table->setFrame(Screen::main().bounds());
        _table->setDataSource(this);
        _table->setDelegate(this);
    }
    return *_table;
}

void TableViewController::viewWillAppear(bool animated)
{
    ViewController::viewWillAppear(animated);
    if (!std::exchange(_hasAppeared, true))
        tableView().reloadData();
    if (const auto row = tableView().selectedRow())
        tableView().deselectRow({0, *row}, animated);
}

std::shared_ptr<View> TableViewController::loadView()
{
    static_cast<void>(tableView());
    return _table;
}

} // namespace orvane
