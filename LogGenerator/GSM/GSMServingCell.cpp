#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/Cells.h"
#include "LogGenerator/GSM/LogCodes.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

constexpr Field kCellFields[] = {
    bytesField("Cell ID", 17, 2, decimal),
    bytesField("ARFCN", 13, 2, decimal),
    bytesField("BSIC", 15, 2, decimal),
};

// Deliberate: cut to their low 16 and 8 bits. The same bytes show uncut in "GSM RR Info".
constexpr Format kLow16Bits = wholeFormat("", {.mask = 0xFFFF});
constexpr Format kLow8Bits = wholeFormat("", {.mask = 0xFF});

constexpr Field kMeasurementFields[] = {
    // Deliberate: not negated.
    bytesField("RSSI", 15, 1, decibelMilliwatts),
    bytesField("C1 Value", 16, 4, kLow16Bits),
    bytesField("C2 Value", 20, 4, kLow16Bits),
};

constexpr Field kDedicatedChannelFields[] = {
    bytesField("MA Dedicated ARFCN", 13, 2, kLow8Bits),
};

constexpr CellRow kCellRows[] = {
    cellRow(kTSCellMonitorCellId, "Cell ID", "GSMServingCell: Failed to retrieve Cell ID\n"),
    cellRow(kTSCellMonitorARFCN, "ARFCN", "GSMServingCell: Failed to retrieve ARFCN\n"),
};

constexpr CellLayout kServingCell = {isServingGsmCell, kCellRows};

constexpr PacketLayout kPackets[] = {
    rowsPacket(kGsmCellCode, 26, kCellFields),
    rowsPacket(kGsmMeasurementCode, 29, kMeasurementFields),
    rowsPacket(kGsmDedicatedChannelCode, 17, kDedicatedChannelFields),
    cellsPacket(kServingCell),
};

constexpr SectionLayout kLayout = {"GSM Serving Cell", "GSMServingCell", UnknownCode::Report,
                                   kPackets};

} // namespace

GSMServingCell::GSMServingCell() : Section(kLayout) {}

} // namespace orvane
