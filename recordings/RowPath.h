#pragma once

#include "platform/base/PropertyValue.h"

#include <functional>
#include <string>
#include <string_view>

namespace orvane
{

// Takes a row: its path in the display tree, and its value. Of rows with one path the later counts.
using RowVisitor = std::function<void(std::string_view path, const PropertyValue& row)>;

// What a person names rows by: the path of a row, or of a group, which stands for all the rows in
// it, "/" for every row. "*" stands for any name at its place, for the elements of a list as a
// rule.
class RowPath
{
public:
    // Rows with a longer path, in bytes, are passed over: the paths of a hostile file could
    // otherwise be a thousand times larger than the file.
    static constexpr std::size_t kLongest = 4096;

    // Slashes that are missing at the start, doubled or trailing do not matter.
    explicit RowPath(std::string_view text);

    [[nodiscard]] const std::string& text() const { return _text; }
    // Whether it has a "*".
    [[nodiscard]] bool isPattern() const;
    // Visits the rows of the display that it stands for, in the order shown.
    void forEachRow(const PropertyValue& display, const RowVisitor& visit) const;

private:
    std::string _text;
};

} // namespace orvane
