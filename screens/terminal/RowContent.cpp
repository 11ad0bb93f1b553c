#include "screens/terminal/RowContent.h"

#include "screens/terminal/LineWidth.h"
#include "screens/terminal/Metrics.h"
#include "screens/toolkit/ScrollView.h"

#include <algorithm>
#include <functional>

namespace orvane
{

namespace
{

constexpr std::size_t kMostCells = 1024;

struct PlacedLabel {
    const Label& label;
    double x;
    const ScrollView* strip; // the strip that holds the label; null for none
    double left;             // the visible range
    double right;
};

void collectLabels(const View& view, double x, const ScrollView* strip, double left, double right,
                   std::vector<PlacedLabel>& labels)
{
    for (const auto& subview : view.subviews()) {
        if (subview->isHidden())
            continue;
        const Rect& frame = subview->frame();
        if (const auto* label = dynamic_cast<const Label*>(subview.get()))
            labels.push_back({*label, x + frame.x, strip, left, right});
        else if (const auto* inner = dynamic_cast<const ScrollView*>(subview.get()))
            collectLabels(*inner, x + frame.x, inner, std::max(left, x + frame.x),
                          std::min(right, x + frame.x + frame.width), labels);
        else
            collectLabels(*subview, x + frame.x, strip, left, right, labels);
    }
}

std::vector<PlacedLabel> labelsOf(const TableViewCell& cell)
{
    std::vector<PlacedLabel> labels;
    const View& content = cell.contentView();
    collectLabels(content, content.frame().x, nullptr, content.frame().x,
                  content.frame().x + content.frame().width, labels);
    return labels;
}

void drawLabel(Canvas& canvas, int line, const PlacedLabel& placed, Style style, int sideways)
{
    const CellGrid::Span span{columnsOfPoints(placed.left), columnsOfPoints(placed.right)};
    const int column = columnsOfPoints(placed.x) - (placed.strip ? sideways : 0);
    const std::string& text = placed.label.text();
    if (placed.strip) {
        canvas.grid.put(line, column, text, style, span);
        return;
    }
    canvas.grid.put(line, column, shortened(text, span.end - column, canvas.marks.cut), style,
                    span);
}

} // namespace

RowContent RowContent::of(const TableViewCell* cell)
{
    RowContent content;
    if (!cell)
        return content;
    content.isGroup = cell->accessory() == CellAccessory::DisclosureIndicator;
    bool isFirst = true;
    for (const PlacedLabel& placed : labelsOf(*cell)) {
        const std::string& text = placed.label.text();
        if (isFirst)
            content.name = text;
        else
            content.value += (content.value.empty() ? "" : " ") + text;
        isFirst = false;
        if (!placed.strip)
            continue;
        content.isStrip = true;
        content.width = columnsOfPoints(placed.strip->frame().width);
        content.extent =
            std::max(content.extent, columnsOfPoints(placed.x - placed.left) + columnsOf(text));
    }
    return content;
}

void drawRow(Canvas& canvas, int line, int columns, const TableViewCell& cell, const RowLook& look)
{
    CellGrid& grid = canvas.grid;
    grid.fill(line, {0, columns}, {Ink::Plain, look.isSelected});
    bool isFirst = true;
    for (const PlacedLabel& placed : labelsOf(cell)) {
        const Ink ink = placed.label.font().isBold || (isFirst && placed.strip) ? Ink::Key
                        : look.isChanged && !isFirst                            ? Ink::Changed
                                                                                : Ink::Plain;
        drawLabel(canvas, line, placed, {ink, look.isSelected}, look.sideways);
        isFirst = false;
    }
    const Style quiet{Ink::Quiet, look.isSelected};
    const RowContent content = RowContent::of(&cell);
    if (look.sideways > 0)
        grid.put(line, 0, canvas.marks.cut, quiet);
    if (content.isStrip && look.sideways < content.overhang())
        grid.put(line, std::min(content.width, columns - 1), canvas.marks.cut, quiet);
    if (cell.accessory() == CellAccessory::DisclosureIndicator)
        grid.put(line, columns - 2, canvas.marks.disclosure, quiet);
    if (cell.accessory() == CellAccessory::Checkmark)
        grid.put(line, columns - 2, canvas.marks.check, quiet);
}

std::shared_ptr<TableViewCell> cellOfRow(TableView& table, std::size_t row)
{
    // Usual tables have fewer rows, all of which keep their cells.
    table.setVisibleRows(row / kMostCells * kMostCells, kMostCells);
    auto cell = table.cellForRow(row);
    if (cell)
        cell->layoutSubviews();
    return cell;
}

} // namespace orvane
