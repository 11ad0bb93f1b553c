#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/GSM/LogCodes.h"

namespace orvane
{

namespace
{

constexpr Field kFields[] = {
    bytesField("Window Size", 14, 2, decimal),
};

constexpr Field kChannelFields[] = {
    bytesField("Transport Channel ID", 0, 1, decimal),
    bytesField("CRC Received", 1, 4, decimal),
    bytesField("CRC Received in Error", 5, 4, decimal),
};

constexpr RecordLayout kChannels = {countAt<13>, startAt<16>, 9, kChannelFields};

constexpr PacketLayout kPackets[] = {
    {kUmtsBlerCode, 16, kFields},
};

constexpr SectionLayout kLayout = {"BLER", "BLER", UnknownCode::Report, kPackets};

} // namespace

BLER::BLER() : Section(kLayout) {}

void BLER::decode(PacketView packet, const PacketLayout& layout)
{
    Section::decode(packet, layout);
    rewriteListRow(rows().get(), "Transport Channels",
                   [&](ListElements& channels) { kChannels.addTo(channels, packet); });
}

} // namespace orvane
