#pragma once

#include "screens/toolkit/TableViewCell.h"

#include <cstddef>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace orvane
{

class TableView;

struct IndexPath {
    std::size_t section = 0;
    std::size_t row = 0;
    [[nodiscard]] std::size_t lastIndex() const { return row; }
    friend bool operator==(const IndexPath&, const IndexPath&) = default;
};

class TableViewDataSource
{
public:
    virtual ~TableViewDataSource() = default;
    virtual std::size_t numberOfSectionsInTableView(TableView&) { return 1; }
    virtual std::size_t numberOfRowsInSection(TableView& table, std::size_t section) = 0;
    virtual std::shared_ptr<TableViewCell> cellForRowAtIndexPath(TableView& table,
                                                                 const IndexPath& indexPath) = 0;
};

class TableViewDelegate
{
public:
    virtual ~TableViewDelegate() = default;
    // Nothing for no row at all.
    virtual void didSelectRowAtIndexPath(TableView& table,
                                         const std::optional<IndexPath>& indexPath) = 0;
};

// A plain table of one section. Cells are made for the rows that the front end says are visible;
// cells of rows that left go to a pool for reuse.
//
// The pool hands back the cell that the same row had, if it is there, else the cell last put in of
// those whose row is gone: in an unchanged table every row keeps its cell, however it is scrolled.
class TableView : public View
{
public:
    // Neither is owned; both may be null.
    void setDataSource(TableViewDataSource* dataSource) { _dataSource = dataSource; }
    void setDelegate(TableViewDelegate* delegate) { _delegate = delegate; }

    // Puts all cells into the pool, forgets the selection and asks the data source anew.
    void reloadData();
    // How often that was, so that a front end sees whether there is something new.
    [[nodiscard]] std::size_t reloadCount() const { return _reloadCount; }
    // As of the last reload.
    [[nodiscard]] std::size_t numberOfRows() const { return _rowCount; }
    [[nodiscard]] double rowHeight() const { return TableViewCell::kDefaultHeight; }
    // Of another width, reloads.
    void setFrame(const Rect& frame) override;
    // As high as all its rows.
    void sizeToFit();

    // The rows that a front end shows, which have cells from now on. Rows that are not there count
    // for nothing.
    void setVisibleRows(std::size_t first, std::size_t count);
    // The cell of a visible row, else null.
    [[nodiscard]] std::shared_ptr<TableViewCell> cellForRow(std::size_t row) const;

    // A cell of that identifier from the pool, else null; for the data source, while it makes the
    // cell of a row.
    std::shared_ptr<TableViewCell> dequeueReusableCell(const std::string& identifier);

    // The user has pressed that row: it is selected, and the delegate told. The delegate may
    // destroy the table.
    void selectRow(std::size_t row);
    void deselectRow(const IndexPath& indexPath, bool animated);
    [[nodiscard]] std::optional<std::size_t> selectedRow() const { return _selectedRow; }

private:
    struct PooledCell {
        std::size_t row;
        std::shared_ptr<TableViewCell> cell;
    };

    void recycle(std::size_t row, std::shared_ptr<TableViewCell> cell);
    void makeVisibleCells();

    TableViewDataSource* _dataSource = nullptr;
    TableViewDelegate* _delegate = nullptr;
    std::size_t _reloadCount = 0;
    std::size_t _rowCount = 0;
    std::size_t _firstVisible = 0;
    std::size_t _visibleCount = 0;
    std::map<std::size_t, std::shared_ptr<TableViewCell>> _cells; // by row
    std::vector<PooledCell> _pool;                                // the last put in is last
    std::size_t _rowBeingMade = 0;
    std::optional<std::size_t> _selectedRow;
};

} // namespace orvane
