#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/LTE/LTEFormats.h"
#include "LogGenerator/LTE/LogCodes.h"

namespace orvane
{

namespace
{

constexpr Field kFields[] = {
    bytesField("E-ARFCN", 17, 2, decimal),
    bytesField("Serving Physical Cell ID", 19, 2, decimal),
    bytesField("Subframe Number", 21, 2, decimal),
    bytesField("Serving Filtered RSRP", 23, 2, rsrpQuarterDb),
    bytesField("Serving Filtered RSRQ", 25, 2, rsrqEighthDb),
};

constexpr PacketLayout kPackets[] = {
    rowsPacket(kLteIntraFrequencyMeasurementCode, 29, kFields),
};

constexpr const char* kName = "Connected mode LTE Intra-frequency Measurement";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Report, kPackets};

} // namespace

ConnectedModeMeasurementMisc::ConnectedModeMeasurementMisc() : Section(kLayout) {}

} // namespace orvane
