#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/GSM/LogCodes.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

constexpr Field kFields[] = {
    bytesField("HSN", 13, 1, decimal),
};

constexpr std::size_t kChannelBytes = 2;

constexpr PacketLayout kPackets[] = {
    {kGsmMobileAllocationCode, 15, kFields},
};

constexpr SectionLayout kLayout = {"Mobile Allocation", "MobileAllocation", UnknownCode::Report,
                                   kPackets};

} // namespace

MobileAllocation::MobileAllocation() : Section(kLayout) {}

void MobileAllocation::decode(PacketView packet, const PacketLayout& layout)
{
    Section::decode(packet, layout);
    std::vector<PropertyValue> channels;
    const Records records(packet, 15, kChannelBytes, countAt<14>(packet));
    forEachWholeRecord(records, kChannelBytes, [&](PacketView record) {
        channels.emplace_back(std::to_string(record.unsignedAt(0, kChannelBytes).value_or(0)));
    });
    setListRow(rows().get(), "ARFCNs", std::move(channels));
}

} // namespace orvane
