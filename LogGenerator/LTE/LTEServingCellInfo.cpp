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
    {6,   "1.4 MHz"}, // resource blocks
    {15,  "3 MHz"  },
    {25,  "5 MHz"  },
    {50,  "10 MHz" },
    {75,  "15 MHz" },
    {100, "20 MHz" },
};

RowText bandwidth(std::int64_t resourceBlocks)
{
    return nameOf(kBandwidths, resourceBlocks, "Unknown");
}

constexpr Field kConfigurationFields[] = {
    bytesField("Physical Cell ID", 14, 2, decimal),
    bytesField("Download Frequency", 16, 2, decimal),
    bytesField("Upload Frequency", 18, 2, decimal),
    bytesField("Download Bandwidth", 20, 1, bandwidth),
    bytesField("Upload Bandwidth", 21, 1, bandwidth),
    bytesField("Cell Identity", 22, 4, decimal),
    bytesField("Tracking Area Code", 26, 2, decimal),
    bytesField("Freq Band Indicator", 28, 4, decimal),
};

constexpr Field kBroadcastFields[] = {
    bytesField("Num Tx Antennas", 20, 1, decimal),
};

constexpr const char* kChannelRow = "UARFCN";

constexpr CellRow kCellRows[] = {
    {kTSCellMonitorTAC,      "Tracking Area Code",  "Serving Cell Info: Failed to retrieve TAC\n"    },
    {kTSCellMonitorCellId,   "Cell Identity",       "Serving Cell Info: Failed to retrieve Cell ID\n"},
    {kTSCellMonitorPID,      "Physical Cell ID",
     "Serving Cell Info: Failed to retrieve Physical Cell ID\n"                                      },
    {kTSCellMonitorBandInfo, "Freq Band Indicator",
     "Serving Cell Info: Failed to retrieve Freq Band Indicator\n"                                   },
    {kTSCellMonitorUARFCN,   kChannelRow,           "Serving Cell Info: Failed to retrieve UARFCN\n" },
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
    // The modem's channels replace the one that the telephony server reports, until it reports it
    // again. This is meant.
    if (layout.logCode == kConfigurationCode)
        if (const auto shown = rows())
            shown->remove(kChannelRow);
    // Goes on to the unknown-code report although the row is written: both effects are meant.
    if (layout.logCode == kBroadcastCode)
        reportUnknownCode(layout.logCode);
}

} // namespace orvane
