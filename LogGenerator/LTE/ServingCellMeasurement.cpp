#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/LTE/LTEFormats.h"

namespace orvane
{

namespace
{

constexpr std::uint32_t kServingMeasurementCode = 0xB17F;
constexpr const char* kNotPresent = "Not Present";

constexpr Format kTransmitPower = minus30.withText(64, kNotPresent);
constexpr Format kSearchThreshold = wholeFormat(" dB", {.factor = 2}).withText(32, kNotPresent);
// Deliberate: the same quantity as kSearchThreshold, but shown in dBm.
constexpr Format kOtherSearchThreshold =
    wholeFormat(" dBm", {.factor = 2}).withText(32, kNotPresent);
constexpr Format kTrueOrFalse = flagFormat("False", "True");

constexpr Field kFields[] = {
    bytesField("Version", 13, 1, decimal),
    bytesField("E-ARFCN", 17, 2, decimal),
    bitsField("Physical Cell ID", 19, 0, 9, decimal),
    bitsField("Serving Layer Priority", 20, 1, 4, decimal),
    bitsField("Measured RSRP", 21, 0, 9, rsrpQuarterDb),
    bitsField("Average RSRP", 22, 1, 9, rsrpQuarterDb),
    bitsField("Measured RSRQ", 23, 2, 7, rsrqQuarterDb),
    bitsField("Average RSRQ", 24, 1, 7, rsrqQuarterDb),
    bitsField("Measured RSSI", 25, 0, 9, rssiHalfDb),
    bitsField("Qrxlevmin", 26, 1, 6, qrxlevmin),
    bitsField("P_Max", 26, 7, 7, kTransmitPower),
    // Deliberate: its 6 bits never reach the value that marks an absent one.
    bitsField("Max UE Tx Power", 27, 6, 6, kTransmitPower),
    bitsField("Srxlev", 29, 0, 7, minus30),
    bitsField("Num of Consecutive DRX Cycles of S < 0", 29, 7, 6, decimal),
    bitsField("S Intra Search", 30, 5, 6, kSearchThreshold),
    bitsField("S Non Intra Search", 31, 3, 6, kOtherSearchThreshold),
    bitsField("Measurement Rules Updated", 32, 1, 1, kTrueOrFalse),
    bitsField("Measurement Rules", 32, 2, 4, decimal),
};

constexpr PacketLayout kPackets[] = {
    rowsPacket(kServingMeasurementCode, 33, kFields),
};

constexpr const char* kName = "Serving Cell Measurements";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Report, kPackets};

} // namespace

ServingCellMeasurement::ServingCellMeasurement() : Section(kLayout) {}

} // namespace orvane
