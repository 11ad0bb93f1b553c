#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/LTE/LogCodes.h"

namespace orvane
{

namespace
{

constexpr Field kCellFields[] = {
    bytesField("Physical Cell ID", 0, 2, decimal),
};

// They follow the measured cells, 6 bytes each from offset 29 on.
std::size_t afterMeasuredCells(PacketView packet) { return 29 + 6 * countAt<27>(packet); }

constexpr RecordLayout kCells = {countAt<28>, afterMeasuredCells, 2, kCellFields};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kLteIntraFrequencyMeasurementCode, 29, kCells),
};

constexpr const char* kName = "Detected Cells";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Report, kPackets};

} // namespace

DetectedCells::DetectedCells() : ListSection(kLayout) {}

} // namespace orvane
