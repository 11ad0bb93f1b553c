#pragma once

#include "screens/terminal/RowContent.h"
#include "screens/toolkit/TableView.h"

#include <cstddef>
#include <map>
#include <string>
#include <vector>

namespace orvane
{

// What the terminal keeps of a table: the rows that match the filter, which of them is selected and
// which are in view, how far long values are scrolled sideways, and which values the latest refresh
// changed. A refresh keeps all of it: rows are found again by their names.
class TableRows
{
public:
    // On a wider terminal it would be hard to see which row a value at the right belongs to.
    static constexpr int kReadableColumns = 100;

    // Fits the table to the columns and lines, and reads it again if it was reloaded.
    void update(TableView& table, int columns, int lines);
    [[nodiscard]] int columns() const { return _columns; }
    // Whether a value is, or was, too long for kReadableColumns.
    [[nodiscard]] bool isWide() const { return _isWide; }
    // As of the last update.
    [[nodiscard]] std::size_t total() const { return _rows.size(); }

    // Whether one of the rows that the filter lets through opens another pane, or has a value that
    // is too long for its place.
    [[nodiscard]] bool hasGroup() const;
    [[nodiscard]] bool hasLongValue() const;
    // Whether the filter hides a row that opens another pane.
    [[nodiscard]] bool hasHiddenGroup() const;

    // Places count the rows that the filter lets through.
    [[nodiscard]] std::size_t count() const { return _matching.size(); }
    [[nodiscard]] std::size_t top() const { return _top; }
    [[nodiscard]] std::size_t selection() const { return _selection; }
    // The row of the table at a place that is less than count().
    [[nodiscard]] std::size_t rowAt(std::size_t place) const { return _matching[place]; }
    [[nodiscard]] RowLook lookAt(std::size_t place) const;
    // Null if no row matches.
    [[nodiscard]] const RowContent* selected() const;

    // A place beyond the last counts as the last.
    void select(std::size_t place);
    void moveBy(std::ptrdiff_t places);
    // Moves the view, and the selection only as far as needed to keep it in view.
    void scrollBy(std::ptrdiff_t places);
    [[nodiscard]] std::ptrdiff_t page() const { return _lines > 1 ? _lines - 1 : 1; }

    // Scrolls the selected row's long value. False if that end of it is in view already.
    bool scrollSideways(bool isRight);
    [[nodiscard]] bool canScrollSideways(bool isRight) const;

    // The part of a name or value, in any case, that rows must have; empty for all rows.
    [[nodiscard]] const std::string& filter() const { return _filter; }
    void setFilter(const std::string& filter);

    // The number of refreshes that changed values.
    [[nodiscard]] std::size_t changeCount() const { return _changeCount; }
    void forgetChanges() { _changed.clear(); }

private:
    // Rows of the same name are told apart by their order.
    using RowName = std::pair<std::string, std::size_t>;

    void read(TableView& table);
    void findChanges(const std::map<RowName, std::string>& before);
    void applyFilter();
    void showSelection();

    std::vector<RowContent> _rows;
    std::vector<RowName> _names; // of the rows
    std::map<RowName, std::string> _values;
    std::map<RowName, bool> _changed;
    std::map<RowName, int> _sideways;
    std::vector<std::size_t> _matching;
    std::string _filter;
    std::size_t _selection = 0;
    std::size_t _top = 0;
    std::ptrdiff_t _lines = 1;
    int _columns = 0;
    bool _isWide = false;
    std::size_t _changeCount = 0;
    std::size_t _reloadsSeen = 0;
    bool _isRead = false;
};

} // namespace orvane
