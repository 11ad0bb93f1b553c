#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/Formats.h"

namespace orvane
{

namespace
{

constexpr std::uint32_t kMeasurementCode = 0xD00A;

RowText filteredPower(std::int64_t raw)
{
    return fixedPoint(static_cast<double>(raw) * 0.00390625, 6); // 256 steps
}

constexpr const char* kSets[] = {"ASET", "MSET", "DSET"}; // active, monitored, detected

// The fourth value has no name, and a cell with it no such row. This is meant.
RowText setName(std::int64_t raw)
{
    return raw < std::ssize(kSets) ? RowText(kSets[raw]) : std::nullopt;
}

RowText trueOrFalse(std::int64_t raw) { return raw != 0 ? "TRUE" : "FALSE"; }

constexpr Field kCellFields[] = {
    bitsField("UARFCN", 0, 0, 14, decimal),           bitsField("Cell ID", 1, 6, 7, decimal),
    bitsField("Filter RSCP", 2, 5, 8, filteredPower), bitsField("Status", 3, 5, 2, setName),
    bitsField("inJDCS", 3, 7, 1, trueOrFalse),
};

std::size_t cellCount(PacketView packet) { return packet.bitsAt(16, 1, 7).value_or(0); }

constexpr RecordLayout kCells = {cellCount, startAt<168>, 16, kCellFields};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kMeasurementCode, 21, kCells),
};

// Calls are logged by another text than the section's name. This is meant.
constexpr SectionLayout kLayout = {"Neighbor Cell List", "NeighbhorMeasurements List",
                                   UnknownCode::Ignore, kPackets};

} // namespace

UTRANNeighbhorMeasurements::UTRANNeighbhorMeasurements() : ListSection(kLayout) {}

} // namespace orvane
