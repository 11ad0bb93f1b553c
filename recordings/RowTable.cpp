#include "recordings/RowTable.h"

#include "platform/base/PropertyValue.h"

#include <unordered_set>
#include <utility>

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
    for (const std::size_t row : _changed)
        _rows[row].hasChanged = false;
    _changed.clear();
    std::swap(_present, _presentBefore);
    _present.clear();
    for (Asked& asked : _asked) {
        if (asked.row != kNoRow)
            _previous = asked.row;
        if (display)
            asked.path.forEachRow(display, [&](std::string_view path, const PropertyValue& row) {
                note(asked, path, row);
            });
    }
    for (const std::size_t row : _presentBefore)
        if (_rows[row].lastPeriod + 1 == _period)
            change(row);
}

void RowTable::note(Asked& asked, std::string_view path, const PropertyValue& value)
{
    asked.hasOccurred = true;
    _previous = rowAt(asked, path);
    Row& row = _rows[_previous];
    if (row.lastPeriod == 0 || row.lastPeriod + 1 < _period || row.value != value) {
        change(_previous);
        row.value = value;
    }
    if (row.lastPeriod != _period)
        _present.push_back(_previous);
    row.lastPeriod = _period;
}

std::size_t RowTable::rowAt(const Asked& asked, std::string_view path)
{
    // Mostly, the rows come as they came in the period before.
    const std::size_t follower = _previous == kNoRow ? kNoRow : _followers[_previous];
    for (const std::size_t likely : {asked.row, follower})
        if (likely != kNoRow && _rows[likely].path == path)
            return likely;
    const auto known = _indices.find(path);
    const std::size_t row = known == _indices.end() ? add(path) : known->second;
    if (_previous != kNoRow)
        _followers[_previous] = row;
    return row;
}

// A new row stands after the one that was met before it.
std::size_t RowTable::add(std::string_view path)
{
    const std::size_t row = _rows.size();
    std::size_t& link = _previous == kNoRow ? _first : _next[_previous];
    const std::size_t next = std::exchange(link, row);
    _next.push_back(next);
    _rows.emplace_back().path = path;
    _followers.push_back(kNoRow);
    _indices.emplace(_rows.back().path, row);
    return row;
}

void RowTable::change(std::size_t row)
{
    if (!std::exchange(_rows[row].hasChanged, true))
        _changed.push_back(row);
}

std::vector<std::size_t> RowTable::order() const
{
    // What turned out to be a group has rows instead of one of its own.
    std::unordered_set<std::size_t> groups;
    for (const Asked& asked : _asked)
        if (asked.hasOccurred && asked.row != kNoRow && _rows[asked.row].lastPeriod == 0)
            groups.insert(asked.row);
    std::vector<std::size_t> shown;
    shown.reserve(_rows.size());
    for (std::size_t row = _first; row != kNoRow; row = _next[row])
        if (!groups.contains(row))
            shown.push_back(row);
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
