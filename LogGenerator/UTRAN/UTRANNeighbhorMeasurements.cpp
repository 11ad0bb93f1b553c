#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/Formats.h"

namespace orvane
{

namespace
{

constexpr std::uint32_t kMeasurementCode = 0xD00A;

constexpr Format kFilteredPower = fixedFormat({.factor = 0.00390625}, 6); // 256 steps

constexpr ValueName kSets[] = {
    {0, "ASET"}, // active
    {1, "MSET"}, // monitored
    {2, "DSET"}, // detected
};
// Deliberate: the fourth value has no name, and a cell with it no such row.
constexpr Format kSetName = namesFormat(kSets, nullptr);
constexpr Format kTrueOrFalse = flagFormat("FALSE", "TRUE");

constexpr Field kCellFields[] = {
    bitsField("UARFCN", 0, 0, 14, decimal),
    bitsField("Cell ID", 1, 6, 7, decimal),
    bitsField("Filter RSCP", 2, 5, 8, kFilteredPower),
    bitsField("Status", 3, 5, 2, kSetName),
    bitsField("inJDCS", 3, 7, 1, kTrueOrFalse),
};

std::size_t cellCount(PacketView packet) { return packet.bitsAt(16, 1, 7).value_or(0); }

constexpr RecordLayout kCells = {cellCount, startAt<168>, 16, kCellFields};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kMeasurementCode, 21, kCells),
};

// Deliberate: calls are logged by another text than the section's name.
constexpr SectionLayout kLayout = {"Neighbor Cell List", "NeighbhorMeasurements List",
                                   UnknownCode::Ignore, kPackets};

} // namespace

UTRANNeighbhorMeasurements::UTRANNeighbhorMeasurements() : ListSection(kLayout) {}

} // namespace orvane
