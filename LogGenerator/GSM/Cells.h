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

// A level that was not measured, which shows an empty text.
constexpr std::int64_t kNotMeasured = 32767;

} // namespace orvane
