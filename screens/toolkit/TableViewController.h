#pragma once

#include "screens/toolkit/TableView.h"
#include "screens/toolkit/ViewController.h"

namespace orvane
{

// A view controller whose view is a table. It fills the table and is told of selections.
class TableViewController : public ViewController,
                            public TableViewDataSource,
                            public TableViewDelegate
{
public:
    ~TableViewController() override;

    [[nodiscard]] TableView& tableView();

    // The first time, fills the table. Later, clears the selection of the row that was opened.
    void viewWillAppear(bool animated) override;

protected:
    [[nodiscard]] std::shared_ptr<View> loadView() override;

private:
    std::shared_ptr<TableView> _table;
    bool _hasAppeared = false;
};

} // namespace orvane
