#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/Cells.h"
#include "LogGenerator/GSM/LogCodes.h"
#include "platform/base/PropertyValue.h"
#include "platform/base/TelephonyConstants.h"

namespace orvane
{

namespace
{

constexpr const char* kChannelRow = "ARFCN";

constexpr Field kNeighbourFields[] = {
    bytesField(kChannelRow, 0, 2, decimal),
    bytesField("RSSI", 2, 1, decimal),
    bytesField("C1 Value", 3, 4, decimal),
};

constexpr RecordLayout kNeighbours = {countAt<28>, startAt<29>, 14, kNeighbourFields};

// The server counts a GSM level in steps of 2 dB.
RowText doubledLevel(std::int64_t level) { return decibelMilliwatts(2 * level); }

constexpr CellRow kCellRows[] = {
    cellRow(kTSCellMonitorARFCN, kChannelRow, "NeighboringCells: Failed to retrieve ARFCN\n"),
    cellRow(kTSCellMonitorRSSI, "RSSI", "NeighboringCells: Failed to retrieve RSSI\n",
            levelText<doubledLevel>),
};

constexpr CellLayout kNeighbouringCells = {isNeighbouringGsmCell, kCellRows};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kGsmMeasurementCode, 29, kNeighbours),
    ownPacket(kGsmBsicListCode, 15),
    cellsPacket(kNeighbouringCells),
};

constexpr SectionLayout kLayout = {"Neighboring Cells", "NeighboringCells", UnknownCode::Report,
                                   kPackets};

} // namespace

NeighboringCells::NeighboringCells() : ListSection(kLayout) {}

void NeighboringCells::decode(PacketView packet, const PacketLayout& layout)
{
    // The list changes nothing that is shown, only what later measurements show.
    if (layout.logCode == kGsmBsicListCode)
        decodeBsicList(packet);
    else
        ListSection::decode(packet, layout);
}

void NeighboringCells::decodeBsicList(PacketView packet)
{
    constexpr std::size_t kEntryBytes = 3;
    arfcnToBsic.clear();
    const Records entries(packet, 15, 4, countAt<14>(packet));
    forEachWholeRecord(entries, kEntryBytes, [&](PacketView entry) {
        const std::uint64_t arfcn = entry.unsignedAt(0, 2).value_or(0);
        const std::uint64_t bsic = entry.unsignedAt(2, 1).value_or(0);
        arfcnToBsic[std::to_string(arfcn)] = std::to_string(bsic);
    });
}

std::vector<PropertyValue> NeighboringCells::elements(PacketView packet, const PacketLayout& layout)
{
    std::vector<PropertyValue> neighbours = ListSection::elements(packet, layout);
    if (layout.logCode != kGsmMeasurementCode)
        return neighbours;
    for (const PropertyValue& neighbour : neighbours)
        if (const std::string* channel = neighbour[kChannelRow].asString())
            if (const auto known = arfcnToBsic.find(*channel); known != arfcnToBsic.end())
                setRow(neighbour.asDictionary(), "BSIC", known->second);
    return neighbours;
}

PropertyValue NeighboringCells::keptValues() const
{
    const PropertyValue values = PropertyValue::newDictionary();
    for (const auto& [arfcn, bsic] : arfcnToBsic)
        values.asDictionary()->set(arfcn, bsic);
    return values;
}

void NeighboringCells::takeKeptValues(const PropertyValue& values)
{
    arfcnToBsic.clear();
    if (const PropertyDictionary* dictionary = values.asDictionary())
        for (const auto& [arfcn, bsic] : *dictionary)
            if (const std::string* text = bsic.asString())
                arfcnToBsic[arfcn] = *text;
}

} // namespace orvane
