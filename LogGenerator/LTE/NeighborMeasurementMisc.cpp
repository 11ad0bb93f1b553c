#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/LTE/LTEFormats.h"
#include "LogGenerator/LTE/LogCodes.h"

namespace orvane
{

namespace
{

constexpr Field kFields[] = {
    bytesField("Version", 13, 1, decimal),
    bytesField("E-ARFCN", 17, 2, decimal),
    bitsField("Qrxlevmin", 19, 0, 6, qrxlevmin),
};

constexpr PacketLayout kPackets[] = {
    rowsPacket(kLteNeighborMeasurementCode, 21, kFields),
};

constexpr const char* kName = "Neighbor Measurements";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Report, kPackets};

} // namespace

NeighborMeasurementMisc::NeighborMeasurementMisc() : Section(kLayout) {}

} // namespace orvane
