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
    // nullopt if no row is selected.
    virtual void didSelectRowAtIndexPath(TableView& table,
                                         const std::optional<IndexPath>& indexPath) = 0;
};

// A plain table with one section. It has cells for the rows that the front end reports as visible.
// Cells of other rows go to a pool for reuse.
//
// From the pool a row gets its own earlier cell if that is there, else the latest cell of a row
// that no longer exists. So every row of an unchanged table keeps its cell while the table is
// scrolled.
class TableView : public View
{
public:
    // Neither is owned; both may be null.
    void setDataSource(TableViewDataSource* dataSource) { _dataSource = dataSource; }
    void setDelegate(TableViewDelegate* delegate) { _delegate = delegate; }

    // Puts all cells into the pool, clears the selection and asks the data source again.
    void reloadData();
    // The number of reloads so far, by which a front end notices a new one.
    [[nodiscard]] std::size_t reloadCount() const { return _reloadCount; }
    // At the last reload.
    [[nodiscard]] std::size_t numberOfRows() const { return _rowCount; }
    [[nodiscard]] double rowHeight() const { return TableViewCell::kDefaultHeight; }
    // Reloads if the width changes.
    void setFrame(const Rect& frame) override;
    // As high as all its rows.
    void sizeToFit();

    // The rows that the front end shows: these have cells from now on. Rows that do not exist are
    // ignored.
    void setVisibleRows(std::size_t first, std::size_t count);
    // The cell of a visible row; null for any other row.
    [[nodiscard]] std::shared_ptr<TableViewCell> cellForRow(std::size_t row) const;

    // A cell with that identifier from the pool, or null. For the data source, while it makes the
    // cell of a row.
    std::shared_ptr<TableViewCell> dequeueReusableCell(const std::string& identifier);

    // The user has pressed that row. Selects it and tells the delegate, which may destroy the
    // table.
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
