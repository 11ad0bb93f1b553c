#pragma once

#include "LogGenerator/CellMonitor.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

// Which of the telephony server's cells the GSM/UMTS sections take, and how a level shows.

inline bool isServingGsmCell(const PropertyValue& cell)
{
    return isCell(cell, kTSCellMonitorRadioAccessTechnologyGSM, kTSCellMonitorCellTypeServing);
}
inline bool isServingUmtsCell(const PropertyValue& cell)
{
    return isCell(cell, kTSCellMonitorRadioAccessTechnologyUMTS, kTSCellMonitorCellTypeServing);
}
inline bool isNeighbouringGsmCell(const PropertyValue& cell)
{
    return isCell(cell, kTSCellMonitorRadioAccessTechnologyGSM, kTSCellMonitorCellTypeNeighbor);
}
inline bool isNeighbouringUmtsCell(const PropertyValue& cell)
{
    return isCell(cell, kTSCellMonitorRadioAccessTechnologyUMTS, kTSCellMonitorCellTypeNeighbor);
}

// A level in the given format; one that was not measured shows an empty text.
template <Format MeasuredLevel>
RowText levelText(std::int64_t level)
{
    constexpr std::int64_t kNotMeasured = 32767;
    return level == kNotMeasured ? std::string() : MeasuredLevel(level);
}

} // namespace orvane
