#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/LogCodes.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

// An entry is read as six bytes but the next one begins after three, so that entries overlap. This
// is meant.
constexpr std::size_t kFirstEntry = 17;
constexpr std::size_t kEntryStride = 3;
constexpr std::size_t kEntryBytes = 6;

// A code of three digits, two bytes apart; what is shown is cut to 16 bits.
RowText codeText(PacketView entry, std::size_t first)
{
    std::uint64_t code = 0;
    for (std::size_t i = 0; i < 3; ++i)
        code = code * 10 + entry.unsignedAt(first + 2 * i, 1).value_or(0);
    return decimal(static_cast<std::int64_t>(code & 0xFFFF));
}

constexpr PacketLayout kPackets[] = {ownPacket(kEquivalentPlmnCode, 17)};

constexpr SectionLayout kLayout = {"Equivalent PLMN List", "Equivalent PLMN List",
                                   UnknownCode::Report, kPackets};

} // namespace

EquivalentPLMNList::EquivalentPLMNList() : ListSection(kLayout) {}

std::vector<PropertyValue> EquivalentPLMNList::elements(PacketView packet, const PacketLayout&)
{
    std::vector<PropertyValue> networks;
    const Records entries(packet, kFirstEntry, kEntryStride, countAt<16>(packet));
    forEachWholeRecord(entries, kEntryBytes, [&](PacketView entry) {
        networks.push_back(PropertyValue::dictionaryOf({
            {"Mobile Country Code", *codeText(entry, 0)},
            {"Mobile Network Code", *codeText(entry, 1)}
        }));
    });
    return networks;
}

} // namespace orvane
