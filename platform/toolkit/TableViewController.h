#pragma once

#include "platform/toolkit/TableView.h"
#include "platform/toolkit/ViewController.h"

namespace orvane
{

// A view controller whose view is one table, which it fills and whose selection it hears of.
class TableViewController : public ViewController,
                            public TableViewDataSource,
                            public TableViewDelegate
{
public:
    ~TableViewController() override;

    [[nodiscard]] TableView& tableView();

protected:
    [[nodiscard]] std::shared_ptr<View> loadView() override;

private:
    std::shared_ptr<TableView> _table;
};

} // namespace orvane
