#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/Cells.h"
#include "LogGenerator/GSM/RankingPacket.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

constexpr Format kReceivedPower = wholeFormat(" dB", {.offset = -21});
constexpr Format kHalfDecibels = fixedFormat({.factor = 0.5}, 6, " dB");
constexpr Format kServerPower = decibelMilliwatts.withText(kNotMeasured, "");
constexpr Format kServerEnergy = decibels.withText(kNotMeasured, "");

constexpr Field kCellFields[] = {
    bytesField("Scrambling Code", 2, 2, decimal),
    bytesField("RSCP", 4, 1, kReceivedPower, Coding::Signed),
    bytesField("Energy Per Chip", 7, 1, kHalfDecibels, Coding::Signed),
    // Deliberate: shown as a signed number, so that 0xFFFF is -1.
    bytesField("Downlink Frequency", 0, 2, decimal, Coding::Signed),
    bytesField("Ranking Value", 8, 2, decimal, Coding::Signed),
    bytesField("Rank Cell RSCP", 5, 2, decibels, Coding::Signed),
};

constexpr RecordLayout kCells = {kUmtsRankingCount, kFirstRankingRecord, 10, kCellFields};

constexpr CellRow kNeighbourRows[] = {
    cellRow(kTSCellMonitorUARFCN, "UARFCN", "UMTSSet: Failed to retrieve UARFCN\n"),
    cellRow(kTSCellMonitorSCN, "Scrambling Code", "UMTSSet: Failed to retrieve Scrambling Code\n"),
    cellRow(kTSCellMonitorRSCP, "RSCP", "UMTSSet: Failed to retrieve RSCP\n", kServerPower),
    cellRow(kTSCellMonitorECN0, "Energy Per Chip", "UMTSSet: Failed to retrieve Energy Per Chip\n",
            kServerEnergy),
};

constexpr CellLayout kNeighbours = {isNeighbouringUmtsCell, kNeighbourRows};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kUmtsRankingCode, kRankingMinimumBytes, kCells),
    cellsPacket(kNeighbours),
};

constexpr SectionLayout kLayout = {"UMTS Set", "UMTSSet", UnknownCode::Report, kPackets};

} // namespace

UMTSSet::UMTSSet() : ListSection(kLayout) {}

} // namespace orvane
