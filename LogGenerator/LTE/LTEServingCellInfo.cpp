#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/Formats.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

constexpr std::uint32_t kConfigurationCode = 0xB0C2;
constexpr std::uint32_t kBroadcastCode = 0xB0C1;

constexpr ValueName kBandwidths[] = {
    {6,   "1.4"}, // resource blocks
    {15,  "3"  },
    {25,  "5"  },
    {50,  "10" },
    {75,  "15" },
    {100, "20" },
};
constexpr Format kBandwidth = namesFormat(kBandwidths, "Unknown").withSuffix(" MHz");

constexpr Field kConfigurationFields[] = {
    bytesField("Physical Cell ID", 14, 2, decimal),
    bytesField("Download Frequency", 16, 2, decimal),
    bytesField("Upload Frequency", 18, 2, decimal),
    bytesField("Download Bandwidth", 20, 1, kBandwidth),
    bytesField("Upload Bandwidth", 21, 1, kBandwidth),
    bytesField("Cell Identity", 22, 4, decimal),
    bytesField("Tracking Area Code", 26, 2, decimal),
    bytesField("Freq Band Indicator", 28, 4, decimal),
};

constexpr Field kBroadcastFields[] = {
    bytesField("Num Tx Antennas", 20, 1, decimal),
};

constexpr const char* kChannelRow = "UARFCN";

constexpr CellRow kCellRows[] = {
    cellRow(kTSCellMonitorTAC, "Tracking Area Code", "Serving Cell Info: Failed to retrieve TAC\n"),
    cellRow(kTSCellMonitorCellId, "Cell Identity",
            "Serving Cell Info: Failed to retrieve Cell ID\n"),
    cellRow(kTSCellMonitorPID, "Physical Cell ID",
            "Serving Cell Info: Failed to retrieve Physical Cell ID\n"),
    cellRow(kTSCellMonitorBandInfo, "Freq Band Indicator",
            "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"),
    cellRow(kTSCellMonitorUARFCN, kChannelRow, "Serving Cell Info: Failed to retrieve UARFCN\n"),
};

bool isServingLteCell(const PropertyValue& cell)
{
    return isCell(cell, kTSCellMonitorRadioAccessTechnologyLTE, kTSCellMonitorCellTypeServing);
}

constexpr CellLayout kServingCell = {isServingLteCell, kCellRows};

constexpr PacketLayout kPackets[] = {
    rowsPacket(kConfigurationCode, 38, kConfigurationFields),
    rowsPacket(kBroadcastCode, 22, kBroadcastFields),
    cellsPacket(kServingCell),
};

constexpr SectionLayout kLayout = {"Serving Cell Info", "LTE Serving Cell Info",
                                   UnknownCode::Report, kPackets};

} // namespace

LTEServingCellInfo::LTEServingCellInfo() : Section(kLayout) {}

void LTEServingCellInfo::decode(PacketView packet, const PacketLayout& layout)
{
    Section::decode(packet, layout);
    // Deliberate: the modem's channels replace the one that the telephony server reports, until it
    // reports it again.
    if (layout.logCode == kConfigurationCode)
        if (const auto shown = rows())
            shown->remove(kChannelRow);
    // Deliberate: the row is written and the code is reported as unknown.
    if (layout.logCode == kBroadcastCode)
        reportUnknownCode(layout.logCode);
}

} // namespace orvane
