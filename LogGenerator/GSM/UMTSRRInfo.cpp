#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/Cells.h"
#include "LogGenerator/GSM/GainControl.h"
#include "LogGenerator/GSM/LogCodes.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

constexpr const char* kChannelRow = "UARFCN";

constexpr ValueName kRrcStates[] = {
    {0, "Disconnected"},
    {1, "Connecting"  },
    {2, "CELL_FACH"   },
    {3, "CELL_DCH"    },
    {4, "CELL_PCH"    },
    {5, "URA_PCH"     },
};

constexpr Format kEnabled = flagFormat("Disabled", "Enabled");

constexpr Field kStateFields[] = {
    bytesField("RRC State", 13, 1, named<kRrcStates>),
};

constexpr Field kIdentityFields[] = {
    bytesField("Cell ID", 21, 4, decimal),
    bytesField("Downlink Frequency", 17, 4, decimal),
    bytesField("Uplink Frequency", 13, 4, decimal),
    bytesField("URA ID", 25, 2, decimal),
};

constexpr Field kCipheringFields[] = {
    bytesField("Ciphering", 13, 1, kEnabled),
};

// "%4.2lf dBm".
constexpr Format kMeanPower = realFormat(2, " dBm").withWidth(4);
constexpr RowDescription kTransmitPower = {"Transmit Power", &kMeanPower};

constexpr Field kTransmitGain = bytesField("", 4, 2, decimal, Coding::Signed);

// The mean in dBm over the records that have a reading. Deliberate: of none it is not a number, and
// shown so.
double meanTransmitPower(PacketView packet)
{
    double sum = 0;
    double count = 0;
    const Records records(packet, 16, 14, countAt<14>(packet));
    forEachWholeRecord(records, kTransmitGain.end(), [&](PacketView record) {
        const std::int64_t gain = kTransmitGain.valueIn(record).value_or(0);
        if (gain == 0)
            return;
        sum += static_cast<double>(gainControlDecibels(gain) - 70);
        count += 1;
    });
    return sum / count;
}

constexpr CellRow kCellRows[] = {
    cellRow(kTSCellMonitorCellId, "Cell ID", "UMTSRRInfo: Failed to retrieve Cell ID\n"),
    cellRow(kTSCellMonitorUARFCN, kChannelRow, "UMTSRRInfo: Failed to retrieve UARFCN\n"),
    cellRow(kTSCellMonitorSCN, "Scrambling Code",
            "UMTSRRInfo: Failed to retrieve Scrambling Code\n"),
};

constexpr CellLayout kServingCell = {isServingUmtsCell, kCellRows};

constexpr PacketLayout kPackets[] = {
    rowsPacket(kUmtsRrcStateCode, 14, kStateFields),
    ownPacket(kUmtsTransmitPowerCode, 16),
    rowsPacket(kUmtsCellIdentityCode, 29, kIdentityFields),
    rowsPacket(kUmtsCipheringCode, 19, kCipheringFields),
    cellsPacket(kServingCell),
};

constexpr SectionLayout kLayout = {"UMTS RR Info", "UMTSRRInfo", UnknownCode::Report, kPackets};

} // namespace

UMTSRRInfo::UMTSRRInfo() : Section(kLayout) {}

void UMTSRRInfo::decode(PacketView packet, const PacketLayout& layout)
{
    Section::decode(packet, layout);
    const auto shown = rows();
    if (layout.logCode == kUmtsTransmitPowerCode)
        setReading(shown.get(), kTransmitPower, bitsOfValue(meanTransmitPower(packet)));
    // The modem shows both frequencies; the telephony server's next record brings its own back.
    if (layout.logCode == kUmtsCellIdentityCode && shown)
        shown->remove(kChannelRow);
}

} // namespace orvane
