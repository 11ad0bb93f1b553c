#pragma once

#include "platform/base/PropertyValue.h"
#include "recordings/RowPath.h"

#include <cstdint>
#include <deque>
#include <string>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace orvane
{

// The rows of a recording that were asked for: which there are, and what they show at the end of
// the period that was taken last.
class RowTable
{
public:
    struct Row {
        std::string path;
        PropertyValue value;
        std::uint64_t lastPeriod = 0; // the last one that it was there in; 0 for none so far
        bool hasChanged = false;      // came, went or shows another value than in the period before
    };

    // Without paths, every row.
    explicit RowTable(const std::vector<std::string>& paths);

    // Takes the display at the end of the next period.
    void take(const PropertyValue& display);

    // In the order in which they were found. The index of a row does not change.
    [[nodiscard]] const std::deque<Row>& rows() const { return _rows; }
    [[nodiscard]] bool isPresent(const Row& row) const
    {
        return _period != 0 && row.lastPeriod == _period;
    }
    // Indices of the rows in the order of the paths that were asked for, those of a pattern or a
    // group as they are shown. A path without "*" is a row of its own even if it never occurred.
    [[nodiscard]] std::vector<std::size_t> order() const;
    // The paths that were asked for and did not occur.
    [[nodiscard]] std::vector<std::string> missingPaths() const;

private:
    static constexpr std::size_t kNoRow = SIZE_MAX;
    struct Asked {
        RowPath path;
        std::size_t row = kNoRow; // of its own, unless it is a pattern
        bool hasOccurred = false;
    };

    void note(Asked& asked, std::string_view path, const PropertyValue& value);
    [[nodiscard]] std::size_t rowAt(const Asked& asked, std::string_view path);
    std::size_t add(std::string_view path);
    void change(std::size_t row);

    std::vector<Asked> _asked;
    std::deque<Row> _rows; // which stay where they are, with their paths
    std::unordered_map<std::string_view, std::size_t> _indices; // by path
    std::vector<std::size_t> _followers;                        // the row met next, the last time
    // The order, as a list: inserting takes no time, however many rows there are.
    std::size_t _first = kNoRow;
    std::vector<std::size_t> _next;
    std::vector<std::size_t> _present; // in this period, and in the one before
    std::vector<std::size_t> _presentBefore;
    std::vector<std::size_t> _changed;
    std::size_t _previous = kNoRow; // the row that was met last in this period
    std::uint64_t _period = 0;
};

} // namespace orvane
