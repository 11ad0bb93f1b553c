#include "screens/toolkit/TableView.h"

#include <algorithm>
#include <utility>

namespace orvane
{

namespace
{

// The most cells that are kept for reuse while a long table is scrolled.
constexpr std::size_t kLargestPool = 1024;

} // namespace

void TableView::reloadData()
{
    ++_reloadCount;
    _selectedRow.reset();
    for (auto& [row, cell] : std::exchange(_cells, {}))
        recycle(row, std::move(cell));
    _rowCount = _dataSource && _dataSource->numberOfSectionsInTableView(*this) > 0
                    ? _dataSource->numberOfRowsInSection(*this, 0)
                    : 0;
    makeVisibleCells();
    changed();
}

void TableView::setFrame(const Rect& frame)
{
    const bool isOtherWidth = frame.width != View::frame().width;
    View::setFrame(frame);
    if (isOtherWidth)
        reloadData();
}

void TableView::sizeToFit()
{
    setFrame({frame().x, frame().y, frame().width, rowHeight() * static_cast<double>(_rowCount)});
}

void TableView::setVisibleRows(std::size_t first, std::size_t count)
{
    if (_firstVisible == first && _visibleCount == count)
        return;
    _firstVisible = first;
    _visibleCount = count;
    makeVisibleCells();
    changed();
}

std::shared_ptr<TableViewCell> TableView::cellForRow(std::size_t row) const
{
    const auto found = _cells.find(row);
    return found == _cells.end() ? nullptr : found->second;
}

std::shared_ptr<TableViewCell> TableView::dequeueReusableCell(const std::string& identifier)
{
    const auto fits = [&](const PooledCell& pooled) {
        return pooled.cell->reuseIdentifier() == identifier;
    };
    auto found = std::find_if(_pool.rbegin(), _pool.rend(), [&](const PooledCell& pooled) {
        return pooled.row == _rowBeingMade && fits(pooled);
    });
    if (found == _pool.rend())
        found = std::find_if(_pool.rbegin(), _pool.rend(), [&](const PooledCell& pooled) {
            return pooled.row >= _rowCount && fits(pooled);
        });
    if (found == _pool.rend())
        return nullptr;
    auto cell = std::move(found->cell);
    _pool.erase(std::next(found).base());
    cell->setFrame({0, 0, frame().width, rowHeight()});
    return cell;
}

void TableView::selectRow(std::size_t row)
{
    if (row >= _rowCount)
        return;
    _selectedRow = row;
    changed();
    if (_delegate)
        _delegate->didSelectRowAtIndexPath(*this, IndexPath{0, row});
}

void TableView::deselectRow(const IndexPath& indexPath, bool)
{
    if (_selectedRow != indexPath.row)
        return;
    _selectedRow.reset();
    changed();
}

void TableView::recycle(std::size_t row, std::shared_ptr<TableViewCell> cell)
{
    cell->removeFromSuperview();
    _pool.push_back({row, std::move(cell)});
    if (_pool.size() > kLargestPool)
        _pool.erase(_pool.begin());
}

void TableView::makeVisibleCells()
{
    const std::size_t first = std::min(_firstVisible, _rowCount);
    const std::size_t last = first + std::min(_visibleCount, _rowCount - first);
    for (auto cell = _cells.begin(); cell != _cells.end();) {
        if (cell->first >= first && cell->first < last) {
            ++cell;
            continue;
        }
        recycle(cell->first, std::move(cell->second));
        cell = _cells.erase(cell);
    }
    for (std::size_t row = first; _dataSource && row < last; ++row) {
        if (_cells.contains(row))
            continue;
        _rowBeingMade = row;
        auto cell = _dataSource->cellForRowAtIndexPath(*this, {0, row});
        if (!cell)
            continue;
        const double top = rowHeight() * static_cast<double>(row);
        cell->setFrame({0, top, frame().width, rowHeight()});
        addSubview(cell);
        _cells[row] = std::move(cell);
    }
}

} // namespace orvane
