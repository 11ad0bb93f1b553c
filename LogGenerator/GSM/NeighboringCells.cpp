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
constexpr Format kServerLevel = wholeFormat(" dBm", {.factor = 2}).withText(kNotMeasured, "");

constexpr RowDescription kBsic = {"BSIC", &decimal};

constexpr CellRow kCellRows[] = {
    cellRow(kTSCellMonitorARFCN, kChannelRow, "NeighboringCells: Failed to retrieve ARFCN\n"),
    cellRow(kTSCellMonitorRSSI, "RSSI", "NeighboringCells: Failed to retrieve RSSI\n",
            kServerLevel),
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
        const auto arfcn = static_cast<std::int64_t>(entry.unsignedAt(0, 2).value_or(0));
        arfcnToBsic[arfcn] = static_cast<std::int64_t>(entry.unsignedAt(2, 1).value_or(0));
    });
}

void NeighboringCells::fill(ListElements& elements, PacketView packet, const PacketLayout& layout)
{
    if (layout.logCode != kGsmMeasurementCode) {
        ListSection::fill(elements, packet, layout);
        return;
    }
    forEachWholeRecord(kNeighbours.in(packet), bytesRead(kNeighbourFields), [&](PacketView record) {
        Reading readings[std::size(kNeighbourFields) + 1] = {};
        std::size_t count = 0;
        for (const Field& field : kNeighbourFields)
            readings[count++] = readingOf(field, field.valueIn(record).value_or(0));
        const auto known = arfcnToBsic.find(readings[0].raw);
        if (known != arfcnToBsic.end())
            readings[count++] = readingOf(kBsic, known->second);
        elements.add(std::span(readings, count));
    });
}

PropertyValue NeighboringCells::keptValues() const
{
    const PropertyValue values = PropertyValue::newDictionary();
    for (const auto& [arfcn, bsic] : arfcnToBsic)
        values.asDictionary()->set(std::to_string(arfcn), PropertyValue::integer(bsic));
    return values;
}

void NeighboringCells::takeKeptValues(const PropertyValue& values)
{
    arfcnToBsic.clear();
    if (const PropertyDictionary* dictionary = values.asDictionary())
        for (const auto& [arfcn, bsic] : *dictionary)
            arfcnToBsic[std::stoll(arfcn)] = bsic.asInteger().value_or(0);
}

} // namespace orvane
