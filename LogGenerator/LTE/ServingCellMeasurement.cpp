#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/LTE/LTEFormats.h"

namespace orvane
{

namespace
{

constexpr std::uint32_t kServingMeasurementCode = 0xB17F;
constexpr const char* kNotPresent = "Not Present";

RowText transmitPower(std::int64_t raw) { return raw == 64 ? kNotPresent : minus30(raw); }

RowText searchThreshold(std::int64_t raw) { return raw == 32 ? kNotPresent : decibels(raw * 2); }

// The same quantity as searchThreshold(), but shown in dBm. This is meant.
RowText searchThresholdInMilliwatts(std::int64_t raw)
{
    return raw == 32 ? kNotPresent : decibelMilliwatts(raw * 2);
}

RowText trueOrFalse(std::int64_t raw) { return raw != 0 ? "True" : "False"; }

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
    bitsField("P_Max", 26, 7, 7, transmitPower),
    // Its 6 bits never reach the value that marks an absent one. This is meant.
    bitsField("Max UE Tx Power", 27, 6, 6, transmitPower),
    bitsField("Srxlev", 29, 0, 7, minus30),
    bitsField("Num of Consecutive DRX Cycles of S < 0", 29, 7, 6, decimal),
    bitsField("S Intra Search", 30, 5, 6, searchThreshold),
    bitsField("S Non Intra Search", 31, 3, 6, searchThresholdInMilliwatts),
    bitsField("Measurement Rules Updated", 32, 1, 1, trueOrFalse),
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
