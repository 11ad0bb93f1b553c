#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/Formats.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

constexpr std::uint32_t kServingCellCode = 0xD0E2;

constexpr Format kAllowedAccess = flagFormat("All Calls", "Emergency Calls Only");

constexpr Field kFields[] = {
    bytesField("Cell Access Restrictions", 14, 1, decimal),
    bytesField("Cell ID", 21, 4, decimal),
    bytesField("Downlink UARFCN", 19, 2, decimal),
    bytesField("Uplink UARFCN", 17, 2, decimal),
    bytesField("URA ID", 15, 1, decimal),
    bitsField("Allowed Access", 25, 0, 1, kAllowedAccess),
};

constexpr CellRow kCellRows[] = {
    cellRow(kTSCellMonitorLAC, "Local Area Code", "Serving Cell Info: Failed to retrieve LAC\n"),
    cellRow(kTSCellMonitorCellId, "Cell ID", "Serving Cell Info: Failed to retrieve Cell ID\n"),
    cellRow(kTSCellMonitorBandInfo, "Freq Band Indicator",
            "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"),
    cellRow(kTSCellMonitorSCN, "Cell Scrambling Code",
            "Serving Cell Info: Failed to retrieve Cell Scrambling Code\n"),
    // One number for both directions, and one line when it is not there.
    cellRow(kTSCellMonitorUARFCN, "Uplink UARFCN",
            "Serving Cell Info: Failed to retrieve UARFCN\n"),
    cellRow(kTSCellMonitorUARFCN, "Downlink UARFCN", nullptr),
};

bool isServingCell(const PropertyValue& cell)
{
    return isCell(cell, kTSCellMonitorRadioAccessTechnologyUTRAN2, kTSCellMonitorCellTypeServing);
}

constexpr PacketLayout kPackets[] = {
    rowsPacket(kServingCellCode, 26, kFields),
    ownPacket(kCellMonitorCode, 0),
};

constexpr SectionLayout kLayout = {"Serving Cell Info", "Serving Cell Info", UnknownCode::Ignore,
                                   kPackets};

} // namespace

UTRANServingCellInfo::UTRANServingCellInfo() : Section(kLayout) {}

void UTRANServingCellInfo::decode(PacketView packet, const PacketLayout& layout)
{
    if (layout.logCode != kCellMonitorCode) {
        Section::decode(packet, layout);
        return;
    }
    // Deliberate: unlike other sections this one does not report a record without cells, and takes
    // every serving cell in turn, so that the last one wins.
    const std::shared_ptr<PropertyArray> cells = cellArray(packet);
    if (!cells)
        return;
    for (const PropertyValue& cell : *cells)
        if (isServingCell(cell))
            writeCellRows(rows().get(), cell, kCellRows);
}

} // namespace orvane
