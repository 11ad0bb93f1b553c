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
constexpr Field kChannel = bytesField("", 0, kChannelBytes, decimal);

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
    const Records records(packet, 15, kChannelBytes, countAt<14>(packet));
    rewriteListRow(rows().get(), "ARFCNs", [&](ListElements& channels) {
        forEachWholeRecord(records, kChannelBytes, [&](PacketView record) {
            const std::int64_t raw = kChannel.valueIn(record).value_or(0);
            channels.add(PropertyValue::reading(readingOf(kChannel, raw)));
        });
    });
}

} // namespace orvane
