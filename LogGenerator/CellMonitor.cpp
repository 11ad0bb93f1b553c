#include "LogGenerator/CellMonitor.h"

#include "LogGenerator/Formats.h"
#include "platform/PropertyList.h"
#include "platform/SystemLog.h"
#include "platform/TelephonyServer.h"

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
        if (const auto number = cellNumber(cell, cellRow.key))
            setRow(rows, cellRow.row, *decimal(*number));
        else
            logError("%s", cellRow.failure);
    }
}

} // namespace orvane
