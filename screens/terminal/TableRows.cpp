#include "screens/terminal/TableRows.h"

#include "screens/terminal/LineWidth.h"
#include "screens/terminal/Metrics.h"

#include <algorithm>
#include <utility>

namespace orvane
{

void TableRows::update(TableView& table, int columns, int lines)
{
    _lines = std::max(lines, 1);
    const bool isRefreshed = !_isRead || table.reloadCount() != _reloadsSeen;
    table.setFrame(rectOfCells(columns, lines)); // reloads, if the width is another one
    if (isRefreshed || columns != _columns) {
        _columns = columns;
        const auto before = std::exchange(_values, {});
        read(table);
        if (isRefreshed && _isRead)
            findChanges(before);
        _isRead = true;
        _reloadsSeen = table.reloadCount();
    }
    showSelection();
}

void TableRows::read(TableView& table)
{
    const bool hadSelection = _selection < _matching.size();
    const RowName selected = hadSelection ? _names[_matching[_selection]] : RowName();
    const std::size_t line = _selection - _top;

    _rows.clear();
    _names.clear();
    _values.clear();
    std::map<std::string, std::size_t> occurrences;
    for (std::size_t row = 0; row < table.numberOfRows(); ++row) {
        _rows.push_back(RowContent::of(cellOfRow(table, row).get()));
        const std::string& name = _rows.back().name;
        _names.emplace_back(name, occurrences[name]++);
        _values[_names.back()] = _rows.back().value;
    }
    std::erase_if(_sideways, [&](const auto& entry) { return !_values.contains(entry.first); });
    std::erase_if(_changed, [&](const auto& entry) { return !_values.contains(entry.first); });
    _isWide = _isWide || std::any_of(_rows.begin(), _rows.end(), [](const RowContent& row) {
                  return row.extent >= kReadableColumns;
              });
    applyFilter();

    const auto found = std::find_if(_matching.begin(), _matching.end(),
                                    [&](std::size_t row) { return _names[row] == selected; });
    if (!hadSelection || found == _matching.end())
        return;
    // The selected row stays where it was on the screen.
    _selection = static_cast<std::size_t>(found - _matching.begin());
    _top = _selection > line ? _selection - line : 0;
}

void TableRows::findChanges(const std::map<RowName, std::string>& before)
{
    _changed.clear();
    // What comes into an empty pane is news as a whole.
    if (before.empty())
        return;
    for (const auto& [name, value] : _values) {
        const auto earlier = before.find(name);
        if (!value.empty() && (earlier == before.end() || earlier->second != value))
            _changed[name] = true;
    }
    if (!_changed.empty())
        ++_changeCount;
}

void TableRows::applyFilter()
{
    _matching.clear();
    for (std::size_t row = 0; row < _rows.size(); ++row)
        if (containsIgnoringCase(_rows[row].name, _filter) ||
            containsIgnoringCase(_rows[row].value, _filter))
            _matching.push_back(row);
}

bool TableRows::hasGroup() const
{
    return std::any_of(_matching.begin(), _matching.end(),
                       [this](std::size_t row) { return _rows[row].isGroup; });
}

bool TableRows::hasLongValue() const
{
    return std::any_of(_matching.begin(), _matching.end(),
                       [this](std::size_t row) { return _rows[row].overhang() > 0; });
}

bool TableRows::hasHiddenGroup() const
{
    const auto isGroup = [](const RowContent& row) { return row.isGroup; };
    const auto groups = std::count_if(_rows.begin(), _rows.end(), isGroup);
    const auto shown = std::count_if(_matching.begin(), _matching.end(),
                                     [&](std::size_t row) { return isGroup(_rows[row]); });
    return groups > shown;
}

void TableRows::showSelection()
{
    const auto lines = static_cast<std::size_t>(_lines);
    _selection = std::min(_selection, _matching.empty() ? 0 : _matching.size() - 1);
    _top = std::min(_top, _matching.size() > lines ? _matching.size() - lines : 0);
    _top = std::clamp(_top, _selection >= lines ? _selection - lines + 1 : 0, _selection);
}

RowLook TableRows::lookAt(std::size_t place) const
{
    const RowName& name = _names[_matching[place]];
    const auto sideways = _sideways.find(name);
    return {place == _selection, _changed.contains(name),
            sideways == _sideways.end()
                ? 0
                : std::min(sideways->second, _rows[_matching[place]].overhang())};
}

const RowContent* TableRows::selected() const
{
    return _selection < _matching.size() ? &_rows[_matching[_selection]] : nullptr;
}

void TableRows::select(std::size_t place)
{
    _selection = place;
    showSelection();
}

void TableRows::moveBy(std::ptrdiff_t places)
{
    const auto now = static_cast<std::ptrdiff_t>(_selection);
    select(static_cast<std::size_t>(std::max<std::ptrdiff_t>(now + places, 0)));
}

void TableRows::scrollBy(std::ptrdiff_t places)
{
    const auto last = static_cast<std::ptrdiff_t>(_matching.size()) - _lines;
    const auto top = std::clamp<std::ptrdiff_t>(static_cast<std::ptrdiff_t>(_top) + places, 0,
                                                std::max<std::ptrdiff_t>(last, 0));
    _top = static_cast<std::size_t>(top);
    select(std::clamp(_selection, _top, _top + static_cast<std::size_t>(_lines) - 1));
}

bool TableRows::canScrollSideways(bool isRight) const
{
    const RowContent* row = selected();
    if (!row)
        return false;
    const int sideways = lookAt(_selection).sideways;
    return isRight ? sideways < row->overhang() : sideways > 0;
}

bool TableRows::scrollSideways(bool isRight)
{
    if (!canScrollSideways(isRight))
        return false;
    const RowContent& row = *selected();
    const int step = std::max(row.width / 2, 1);
    int& sideways = _sideways[_names[_matching[_selection]]];
    sideways = std::clamp(std::min(sideways, row.overhang()) + (isRight ? step : -step), 0,
                          row.overhang());
    return true;
}

void TableRows::setFilter(const std::string& filter)
{
    const bool hadSelection = _selection < _matching.size();
    const std::size_t selected = hadSelection ? _matching[_selection] : 0;
    _filter = filter;
    applyFilter();
    // The selected row stays selected as long as it is there, else the first below it is.
    const auto found = std::lower_bound(_matching.begin(), _matching.end(), selected);
    _selection = static_cast<std::size_t>(found - _matching.begin());
    showSelection();
}

} // namespace orvane
