#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/Formats.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

constexpr std::uint32_t kMeasurementCode = 0xD00E;

constexpr Field kCellFields[] = {
    bitsField("Cell ID", 0, 0, 14, decimal),
    bitsField("Band Indicator", 1, 6, 1, decimal),
    bitsField("BSIC Valid", 1, 7, 1, decimal),
    bytesField("NCC", 2, 1, decimal),
    bytesField("BCC", 3, 1, decimal),
    bytesField("ARFCN", 4, 2, decimal),
    bytesField("RSSI", 6, 2, decimal, Coding::Signed),
};

constexpr RecordLayout kCells = {countAt<16>, startAt<17>, 8, kCellFields};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kMeasurementCode, 17, kCells),
};

constexpr const char* kName = "GSM Neighbor Cell List";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Ignore, kPackets};

} // namespace

GSMNeighbhorMeasurements::GSMNeighbhorMeasurements() : ListSection(kLayout) {}

std::vector<PropertyValue> GSMNeighbhorMeasurements::decodedCells(PacketView packet)
{
    return recordRows(kCells.in(packet), kCellFields);
}

void GSMNeighbhorMeasurements::decode(PacketView, const PacketLayout&)
{
    clearElementsInArray(list().get());
    // Deliberate: none of the packet's cells is shown, so that every packet leaves an empty list.
}

} // namespace orvane
