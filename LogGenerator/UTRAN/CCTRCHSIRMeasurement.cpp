#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/UTRAN/TransportChannels.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

constexpr Field kChannelFields[] = {
    bytesField("CCTRCH ID", 0, 1, decimal),
    bytesField("TSNUM", 1, 1, decimal),
};

constexpr std::size_t kChannelBytes = 8;
constexpr std::size_t kFirstRatio = 2; // one byte each, up to the record's end

constexpr RecordLayout kChannels = {compositeChannelCount, firstCompositeChannel, kChannelBytes,
                                    kChannelFields};

constexpr RowDescription kRatio = {"", &unsignedDecimal};

void addRatios(ListElements& ratios, PacketView record)
{
    for (std::size_t offset = kFirstRatio; offset < kChannelBytes; ++offset) {
        const auto raw = static_cast<std::int64_t>(record.unsignedAt(offset, 1).value_or(0));
        ratios.add(PropertyValue::reading(readingOf(kRatio, raw)));
    }
}

constexpr PacketLayout kPackets[] = {
    recordsPacket(kUtranTransportChannelsCode, kUtranTransportChannelsBytes, kChannels),
};

constexpr SectionLayout kLayout = {"CCTRCH SIR", "CCTRCH SIR Measurement", UnknownCode::Ignore,
                                   kPackets};

} // namespace

CCTRCHSIRMeasurement::CCTRCHSIRMeasurement() : ListSection(kLayout) {}

void CCTRCHSIRMeasurement::fill(ListElements& elements, PacketView packet, const PacketLayout&)
{
    forEachWholeRecord(kChannels.in(packet), kChannelBytes, [&](PacketView record) {
        PropertyDictionary& channel =
            elements.addRows(kChannelFields[0], std::size(kChannelFields) + 1);
        writeRows(&channel, record, kChannelFields);
        rewriteListRow(&channel, "SIR", [&](ListElements& ratios) { addRatios(ratios, record); });
    });
}

} // namespace orvane
