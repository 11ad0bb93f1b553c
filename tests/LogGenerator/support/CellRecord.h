#pragma once

#include "LogGenerator/support/PacketBuilder.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

#include <initializer_list>
#include <utility>

namespace orvane
{

// Cells as the telephony server reports them, and the record that carries them.

constexpr std::uint32_t kCellRecord = 0xFF0001;

using CellNumber = std::pair<const char*, std::int64_t>;

inline PropertyValue cellOf(const char* technology, const char* type,
                            std::initializer_list<CellNumber> numbers = {})
{
    PropertyValue cell = PropertyValue::dictionaryOf({
        {kTSCellMonitorCellRadioAccessTechnology, technology},
        {kTSCellMonitorCellType,                  type      }
    });
    for (const auto& [key, number] : numbers)
        cell.asDictionary()->set(key, PropertyValue::integer(number));
    return cell;
}

inline PropertyValue servingGsm(std::initializer_list<CellNumber> numbers = {})
{
    return cellOf(kTSCellMonitorRadioAccessTechnologyGSM, kTSCellMonitorCellTypeServing, numbers);
}
inline PropertyValue servingUmts(std::initializer_list<CellNumber> numbers = {})
{
    return cellOf(kTSCellMonitorRadioAccessTechnologyUMTS, kTSCellMonitorCellTypeServing, numbers);
}
inline PropertyValue neighbouringGsm(std::initializer_list<CellNumber> numbers = {})
{
    return cellOf(kTSCellMonitorRadioAccessTechnologyGSM, kTSCellMonitorCellTypeNeighbor, numbers);
}
inline PropertyValue neighbouringUmts(std::initializer_list<CellNumber> numbers = {})
{
    return cellOf(kTSCellMonitorRadioAccessTechnologyUMTS, kTSCellMonitorCellTypeNeighbor, numbers);
}

inline Bytes cellRecord(std::initializer_list<PropertyValue> cells)
{
    return PacketBuilder::withPropertyList(kCellRecord, PropertyValue::arrayOf(cells));
}

} // namespace orvane
