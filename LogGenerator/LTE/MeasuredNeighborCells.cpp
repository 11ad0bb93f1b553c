#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/LTE/LTEFormats.h"
#include "LogGenerator/LTE/LogCodes.h"

namespace orvane
{

namespace
{

constexpr Field kCellFields[] = {
    bytesField("Physical Cell ID", 0, 2, decimal),
    bytesField("Filtered RSRP", 2, 2, rsrpQuarterDb),
    bytesField("Filtered RSRQ", 4, 2, rsrqEighthDb),
};

constexpr RecordLayout kCells = {countAt<27>, startAt<29>, 6, kCellFields};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kLteIntraFrequencyMeasurementCode, 29, kCells),
};

constexpr const char* kName = "Measured Neighbor Cells";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Report, kPackets};

} // namespace

MeasuredNeighborCells::MeasuredNeighborCells() : ListSection(kLayout) {}

} // namespace orvane
