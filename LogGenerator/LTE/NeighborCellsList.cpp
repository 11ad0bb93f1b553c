#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/LTE/LTEFormats.h"
#include "LogGenerator/LTE/LogCodes.h"
#include "platform/base/PropertyValue.h"
#include "platform/services/Services.h"

namespace orvane
{

namespace
{

constexpr Field kIdentity = bitsField("Physical Cell ID", 0, 0, 9, decimal);
constexpr Field kMeasuredRssi = bitsField("Measured RSSI", 1, 1, 8, rssiHalfDb);
constexpr Field kMeasuredRsrp = bitsField("Measured RSRP", 2, 1, 9, rsrpHalfDb);
constexpr Field kAverageRsrp = bitsField("Average RSRP", 4, 0, 9, rsrpHalfDb);
constexpr Field kMeasuredRsrq = bitsField("Measured RSRQ", 5, 1, 7, rsrqQuarterDb);
constexpr Field kAverageRsrq = bitsField("Average RSRQ", 6, 0, 7, rsrqQuarterDb);

constexpr Field kCellFields[] = {
    kIdentity,
    kMeasuredRssi,
    kMeasuredRsrp,
    kAverageRsrp,
    kMeasuredRsrq,
    kAverageRsrq,
    bitsField("Srxlev", 6, 7, 7, minus30),
    bytesField("Frequency Offset", 8, 2, decimal),
    bitsField("Ant 0 Frame Offset", 12, 0, 11, decimal),
    bitsField("Ant 0 Sample Offset", 13, 3, 19, decimal),
    // Deliberate: the second antenna repeats the first one's numbers.
    bitsField("Ant 1 Frame Offset", 12, 0, 11, decimal),
    bitsField("Ant 1 Sample Offset", 13, 3, 19, decimal),
};

// The packet carries one less than there are, so that there is always a cell.
std::size_t cellCount(PacketView packet) { return packet.bitsAt(19, 6, 5).value_or(0) + 1; }

constexpr RecordLayout kCells = {cellCount, startAt<21>, 20, kCellFields};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kLteNeighborMeasurementCode, 21, kCells),
};

constexpr const char* kName = "Neighbor Cells List";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Report, kPackets};

constexpr Field kLoggedLevels[] = {kMeasuredRssi, kMeasuredRsrp, kAverageRsrp, kMeasuredRsrq,
                                   kAverageRsrq};

void logCell(PacketView record)
{
    logWarning("Physical Cell ID: %d\n", static_cast<int>(kIdentity.valueIn(record).value_or(0)));
    // Deliberate: every level is called the RSSI.
    for (const Field& level : kLoggedLevels)
        logWarning("Measured RSSI: %lf\n",
                   level.format->number(level.valueIn(record).value_or(0)).value_or(0));
}

} // namespace

NeighborCellsList::NeighborCellsList() : ListSection(kLayout) {}

void NeighborCellsList::fill(ListElements& elements, PacketView packet, const PacketLayout& layout)
{
    if (Services::current().log().accepts(LogPriority::Warning)) {
        const Records cells = kCells.in(packet);
        logWarning("Number of neighboring cells being reported: %d\n",
                   static_cast<int>(cells.count()));
        forEachWholeRecord(cells, bytesRead(kCellFields), logCell);
    }
    ListSection::fill(elements, packet, layout);
}

} // namespace orvane
