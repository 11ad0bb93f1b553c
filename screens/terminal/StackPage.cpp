#include "screens/terminal/StackPage.h"

#include "screens/terminal/LineWidth.h"
#include "screens/terminal/Toolbar.h"
#include "screens/toolkit/Playback.h"
#include "screens/toolkit/TableViewController.h"

#include <algorithm>

namespace orvane
{

namespace
{

bool sameOwner(const std::weak_ptr<ViewController>& one, const std::weak_ptr<ViewController>& other)
{
    return !one.owner_before(other) && !other.owner_before(one);
}

} // namespace

void StackPage::show(NavigationController* stack, Playback* playback)
{
    _stack = stack;
    _playback = playback;
}

TableViewController* StackPage::top() const
{
    return _stack ? dynamic_cast<TableViewController*>(_stack->topViewController()) : nullptr;
}

const TableRows* StackPage::rows() const
{
    TableViewController* controller = top();
    const auto found = controller ? _rows.find(controller->weak_from_this()) : _rows.end();
    return found == _rows.end() ? nullptr : &found->second;
}

TableRows* StackPage::rows() { return const_cast<TableRows*>(std::as_const(*this).rows()); }

std::size_t StackPage::changeCount() const
{
    std::size_t count = 0;
    for (const auto& [controller, rows] : _rows)
        count += rows.changeCount();
    return count;
}

void StackPage::forgetChanges()
{
    for (auto& [controller, rows] : _rows)
        rows.forgetChanges();
}

std::vector<Crumb> StackPage::crumbs() const
{
    std::vector<Crumb> crumbs;
    if (!_stack)
        return crumbs;
    for (const auto& controller : _stack->viewControllers())
        crumbs.push_back({controller->title(), [this, weak = std::weak_ptr(controller)] {
                              if (const auto target = weak.lock(); target && _stack)
                                  _stack->popToViewController(*target, true);
                          }});
    return crumbs;
}

void StackPage::draw(Canvas& canvas, Lines area)
{
    const int controls = std::min(PlaybackLine::linesNeeded(_playback), area.count - 1);
    const Lines body{area.first, std::max(area.count - 1 - controls, 0)};
    updateTables(canvas.columns(), body.count);
    if (!top() || !sameOwner(_lastTop, top()->weak_from_this()))
        _filterEditor.reset(); // the filter was typed for another table
    _lastTop = top() ? top()->weak_from_this() : TableKey();
    _isBusy = top() && orvane::isBusy(*top());
    drawRows(canvas, body);
    PlaybackLine::draw(canvas, {body.end(), controls}, _playback);
    drawStatus(canvas, area.end() - 1);
}

// Updates all tables of the stack, so that each knows the values that the latest refresh changed.
void StackPage::updateTables(int columns, int lines)
{
    std::erase_if(_rows, [](const auto& entry) { return entry.first.expired(); });
    if (!_stack)
        return;
    const auto update = [&] {
        for (const auto& controller : _stack->viewControllers())
            if (auto* tables = dynamic_cast<TableViewController*>(controller.get()))
                _rows[controller].update(tables->tableView(), rowColumns(columns), lines);
    };
    const int before = rowColumns(columns);
    update();
    if (rowColumns(columns) != before)
        update();
}

int StackPage::rowColumns(int columns) const
{
    const TableRows* shown = rows();
    return shown && shown->isWide() ? columns : std::min(columns, TableRows::kReadableColumns);
}

std::vector<std::string> StackPage::emptyText() const
{
    const TableRows* shown = rows();
    if (shown && shown->total() > 0) {
        std::vector<std::string> text{"No row here has \"" + shown->filter() + "\""};
        if (shown->hasHiddenGroup())
            text.emplace_back("The filter does not look inside groups: press Escape, open one, "
                              "and filter its rows.");
        return text;
    }
    if (_playback)
        return {_playback->progress() < 1 ? "Reading the file" : "No data yet"};
    if (_isBusy)
        return {"Waiting for the telephony server", _waitingHint};
    return {"No data yet"};
}

void StackPage::drawRows(Canvas& canvas, Lines area)
{
    const TableRows* shown = rows();
    if (!shown || shown->count() == 0) {
        drawMessage(canvas, area, emptyText());
        return;
    }
    for (int i = 0; i < area.count; ++i) {
        const std::size_t place = shown->top() + static_cast<std::size_t>(i);
        if (place >= shown->count())
            break;
        const int line = area.first + i;
        const RowLook look = shown->lookAt(place);
        if (const auto cell = cellOfRow(top()->tableView(), shown->rowAt(place)))
            drawRow(canvas, line, shown->columns(), *cell, look);
        canvas.onClick({line, 1}, {0, shown->columns()}, [this, place](int) { clickPlace(place); });
        if (look.isSelected)
            canvas.cursor = {line, 0, false};
    }
}

void StackPage::drawStatus(Canvas& canvas, int line)
{
    const Style bar{Ink::BarQuiet, false};
    canvas.grid.fill(line, canvas.grid.wholeLine(), bar);
    const TableRows* shown = rows();
    const int start = top() ? drawToolbar(canvas, line, *top()) : 1;
    if (!shown || shown->total() == 0)
        return;
    std::string place = std::to_string(shown->count() == 0 ? 0 : shown->selection() + 1) + "/" +
                        std::to_string(shown->count());
    if (!shown->filter().empty())
        place = "\"" + shown->filter() + "\" " + place + " of " + std::to_string(shown->total());
    const int column = canvas.columns() - 1 - columnsOf(place);
    if (column > start)
        canvas.grid.put(line, column, place, bar);
}

bool StackPage::drawPrompt(Canvas& canvas, int line)
{
    if (_playbackLine.hasPrompt()) {
        _playbackLine.drawPrompt(canvas, line);
        return true;
    }
    if (!_filterEditor)
        return false;
    const std::string advice = "Enter keep  Esc show all";
    const int start = canvas.grid.put(line, 1, "Filter: ", {Ink::StatusKey, false});
    int end = canvas.columns() - 1;
    if (end - start > columnsOf(advice) + 10) {
        end -= columnsOf(advice);
        canvas.grid.put(line, end, advice, {Ink::Quiet, false});
        end -= 2;
    }
    _filterEditor->draw(canvas, line, {start, end}, {Ink::Status, false});
    return true;
}

} // namespace orvane
