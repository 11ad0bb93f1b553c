#include "LogGenerator/CellMonitor.h"

#include "platform/base/TelephonyConstants.h"
#include "platform/plist/PropertyList.h"
#include "platform/services/SystemLog.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace orvane
{

namespace
{

bool isText(const PropertyValue& value, const char* text)
{
    const std::string* string = value.asString();
    return string && *string == text;
}

std::shared_ptr<PropertyArray> cellArrayOrReport(PacketView record)
{
    std::shared_ptr<PropertyArray> cells = cellArray(record);
    if (!cells)
        logError("Failed to get Cell Array\n");
    return cells;
}

} // namespace

std::shared_ptr<PropertyArray> cellArray(PacketView record)
{
    const PropertyValue root = readPropertyList(record.from(kLogHeaderBytes).bytes()).value;
    if (!root)
        logError("Cell Info Array data could not be constructed");
    return root.sharedArray();
}

bool isCell(const PropertyValue& cell, const char* technology, const char* type)
{
    return isText(cell[kTSCellMonitorCellRadioAccessTechnology], technology) &&
           isText(cell[kTSCellMonitorCellType], type);
}

std::optional<std::int32_t> cellNumber(const PropertyValue& cell, const char* key)
{
    using Limits = std::numeric_limits<std::int32_t>;
    const PropertyValue& value = cell[key];
    if (const auto integer = value.asInteger()) {
        if (*integer < Limits::min() || *integer > Limits::max())
            return std::nullopt;
        return static_cast<std::int32_t>(*integer);
    }
    const auto real = value.asReal();
    // Written so that a not-a-number fails each comparison.
    if (!real || !(*real >= Limits::min() && *real <= Limits::max()) || *real != std::floor(*real))
        return std::nullopt;
    return static_cast<std::int32_t>(*real);
}

void writeCellRows(PropertyDictionary* rows, const PropertyValue& cell,
                   std::span<const CellRow> cellRows)
{
    for (const CellRow& cellRow : cellRows) {
        if (const auto number = cellNumber(cell, cellRow.key)) {
            setReading(rows, cellRow, *number);
        } else if (cellRow.failure) {
            logError("%s", cellRow.failure);
        }
    }
}

void writeFirstCell(PropertyDictionary* rows, PacketView record, const CellLayout& layout)
{
    const std::shared_ptr<PropertyArray> cells = cellArrayOrReport(record);
    if (!cells)
        return;
    const auto cell = std::find_if(cells->begin(), cells->end(), layout.isWanted);
    if (cell != cells->end())
        writeCellRows(rows, *cell, layout.rows);
}

void addCells(ListElements& elements, PacketView record, const CellLayout& layout)
{
    const std::shared_ptr<PropertyArray> cells = cellArrayOrReport(record);
    if (!cells)
        return;
    for (const PropertyValue& cell : *cells) {
        if (!layout.isWanted(cell))
            continue;
        PropertyValue element = PropertyValue::newDictionary();
        writeCellRows(element.asDictionary(), cell, layout.rows);
        elements.add(std::move(element));
    }
}

} // namespace orvane
