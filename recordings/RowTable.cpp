#include "recordings/RowTable.h"

#include "platform/base/PropertyValue.h"

#include <algorithm>

namespace orvane
{

RowTable::RowTable(const std::vector<std::string>& paths)
{
    for (const std::string& path : paths)
        _asked.push_back({RowPath(path)});
    if (paths.empty())
        _asked.push_back({RowPath("/")});
    for (Asked& asked : _asked)
        if (!asked.path.isPattern())
            asked.row = _previous = rowAt(asked, asked.path.text());
}

void RowTable::take(const PropertyValue& display)
{
    ++_period;
    _previous = kNoRow;
    for (Row& row : _rows)
        row.hasChanged = false;
    for (Asked& asked : _asked) {
        if (asked.row != kNoRow)
            _previous = asked.row;
        if (display)
            asked.path.forEachRow(display, [&](std::string_view path, const PropertyValue& row) {
                note(asked, path, row);
            });
    }
    for (Row& row : _rows)
        if (row.lastPeriod != 0 && row.lastPeriod + 1 == _period)
            row.hasChanged = true;
}

void RowTable::note(Asked& asked, std::string_view path, const PropertyValue& value)
{
    asked.hasOccurred = true;
    _previous = rowAt(asked, path);
    Row& row = _rows[_previous];
    if (row.lastPeriod == 0 || row.lastPeriod + 1 < _period || row.value != value) {
        row.hasChanged = true;
        row.value = value;
    }
    row.lastPeriod = _period;
}

std::size_t RowTable::rowAt(const Asked& asked, std::string_view path)
{
    // Mostly, the rows come as they came in the period before.
    const std::size_t follower = _previous == kNoRow ? kNoRow : _followers[_previous];
    for (const std::size_t likely : {asked.row, follower})
        if (likely != kNoRow && _rows[likely].path == path)
            return likely;
    const auto known = _indices.find(std::string(path));
    const std::size_t row = known == _indices.end() ? add(path) : known->second;
    if (_previous != kNoRow)
        _followers[_previous] = row;
    return row;
}

// A new row stands behind the one that was met before it.
std::size_t RowTable::add(std::string_view path)
{
    const std::size_t row = _rows.size();
    const auto previous = std::find(_order.begin(), _order.end(), _previous);
    _order.insert(previous == _order.end() ? _order.begin() : previous + 1, row);
    _rows.emplace_back().path = path;
    _followers.push_back(kNoRow);
    _indices.emplace(path, row);
    return row;
}

std::vector<std::size_t> RowTable::order() const
{
    std::vector<std::size_t> shown = _order;
    // What turned out to be a group has rows instead of one of its own.
    for (const Asked& asked : _asked)
        if (asked.hasOccurred && asked.row != kNoRow && _rows[asked.row].lastPeriod == 0)
            std::erase(shown, asked.row);
    return shown;
}

std::vector<std::string> RowTable::missingPaths() const
{
    std::vector<std::string> missing;
    for (const Asked& asked : _asked)
        if (!asked.hasOccurred)
            missing.push_back(asked.path.text());
    return missing;
}

} // namespace orvane
