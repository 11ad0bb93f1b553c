#pragma once

#include "screens/toolkit/TableView.h"
#include "screens/toolkit/ViewController.h"

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

    // The first time, fills the table; later, deselects the row that led to what was in front.
    void viewWillAppear(bool animated) override;

protected:
    [[nodiscard]] std::shared_ptr<View> loadView() override;

private:
    std::shared_ptr<TableView> _table;
    bool _hasAppeared = false;
};

} // namespace orvane
