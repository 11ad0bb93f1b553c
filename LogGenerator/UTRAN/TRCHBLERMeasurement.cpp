#include "LogGenerator/UTRAN/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/UTRAN/TransportChannels.h"

namespace orvane
{

namespace
{

constexpr Field kChannelFields[] = {
    bytesField("TRCH ID", 0, 1, decimal),
    bytesField("TRCH BLER Measurement", 1, 1, decimal),
};

constexpr RecordLayout kChannels = {transportChannelCount, startAt<17>, 2, kChannelFields};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kUtranTransportChannelsCode, kUtranTransportChannelsBytes, kChannels),
};

constexpr SectionLayout kLayout = {"TRCH BLER", "TRCH BLER Measurement", UnknownCode::Ignore,
                                   kPackets, LogPriority::Notice};

} // namespace

TRCHBLERMeasurement::TRCHBLERMeasurement() : ListSection(kLayout) {}

} // namespace orvane
