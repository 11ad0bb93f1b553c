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

std::vector<PropertyValue> ratios(PacketView record)
{
    std::vector<PropertyValue> texts;
    for (std::size_t offset = kFirstRatio; offset < kChannelBytes; ++offset)
        texts.emplace_back(std::to_string(record.unsignedAt(offset, 1).value_or(0)));
    return texts;
}

constexpr PacketLayout kPackets[] = {
    recordsPacket(kUtranTransportChannelsCode, kUtranTransportChannelsBytes, kChannels),
};

constexpr SectionLayout kLayout = {"CCTRCH SIR", "CCTRCH SIR Measurement", UnknownCode::Ignore,
                                   kPackets};

} // namespace

CCTRCHSIRMeasurement::CCTRCHSIRMeasurement() : ListSection(kLayout) {}

std::vector<PropertyValue> CCTRCHSIRMeasurement::elements(PacketView packet, const PacketLayout&)
{
    std::vector<PropertyValue> channels;
    forEachWholeRecord(kChannels.in(packet), kChannelBytes, [&](PacketView record) {
        channels.push_back(PropertyValue::newDictionary());
        PropertyDictionary* channel = channels.back().asDictionary();
        writeRows(channel, record, kChannelFields);
        setListRow(channel, "SIR", ratios(record));
    });
    return channels;
}

} // namespace orvane
