#pragma once

#include "LogGenerator/Formats.h"
#include "LogGenerator/Records.h"
#include "platform/base/LogMessage.h"
#include "platform/base/PropertyValue.h"

#include <cstdint>
#include <optional>
#include <span>
#include <vector>

namespace orvane
{

// Cell-monitor records: after the 13-byte header a property list whose root is an array of cell
// dictionaries, which the telephony server makes.

// The array of cells; null when the record cannot be parsed (one error line) or its root is no
// array.
std::shared_ptr<PropertyArray> cellArray(PacketView record);

// Whether the cell's technology and type are these (kTSCellMonitor... texts); a cell that lacks
// either is not.
bool isCell(const PropertyValue& cell, const char* technology, const char* type);

// A number of a cell or nothing: an integer, or a real without fraction, within 32 signed bits.
std::optional<std::int32_t> cellNumber(const PropertyValue& cell, const char* key);

// One row that a cell's number fills.
struct CellRow : RowDescription {
    const char* key;
    const char* failure; // logged at error priority when there is no such number; may be null
};

// The format is static data.
constexpr CellRow cellRow(const char* key, const char* row, const char* failure,
                          const Format& format = decimal)
{
    return {
        {row, &format},
        key, failure
    };
}

// What a section takes from the cells: which of them, and their rows.
struct CellLayout {
    bool (*isWanted)(const PropertyValue& cell);
    std::span<const CellRow> rows;
};

// Writes the rows in order; a number that is not there leaves its row as it was.
void writeCellRows(PropertyDictionary* rows, const PropertyValue& cell,
                   std::span<const CellRow> cellRows);
// Writes the rows of the first wanted cell of the record. A record without an array of cells is
// reported.
void writeFirstCell(PropertyDictionary* rows, PacketView record, const CellLayout& layout);
// Adds a dictionary, which may be empty, for each wanted cell of the record. A record without an
// array of cells is reported.
void addCells(ListElements& elements, PacketView record, const CellLayout& layout);

} // namespace orvane
