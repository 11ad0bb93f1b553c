#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/LogCodes.h"
#include "platform/base/PropertyValue.h"

namespace orvane
{

namespace
{

// Deliberate: an entry is read as six bytes but the next one begins after three, so that entries
// overlap.
constexpr std::size_t kFirstEntry = 17;
constexpr std::size_t kEntryStride = 3;
constexpr std::size_t kEntryBytes = 6;

// A code of three digits, two bytes apart; what is shown is cut to 16 bits.
std::int64_t code(PacketView entry, std::size_t first)
{
    std::uint64_t digits = 0;
    for (std::size_t i = 0; i < 3; ++i)
        digits = digits * 10 + entry.unsignedAt(first + 2 * i, 1).value_or(0);
    return static_cast<std::int64_t>(digits & 0xFFFF);
}

constexpr RowDescription kCountryCode = {"Mobile Country Code", &decimal};
constexpr RowDescription kNetworkCode = {"Mobile Network Code", &decimal};

constexpr PacketLayout kPackets[] = {ownPacket(kEquivalentPlmnCode, 17)};

constexpr SectionLayout kLayout = {"Equivalent PLMN List", "Equivalent PLMN List",
                                   UnknownCode::Report, kPackets};

} // namespace

EquivalentPLMNList::EquivalentPLMNList() : ListSection(kLayout) {}

void EquivalentPLMNList::fill(ListElements& elements, PacketView packet, const PacketLayout&)
{
    const Records entries(packet, kFirstEntry, kEntryStride, countAt<16>(packet));
    forEachWholeRecord(entries, kEntryBytes, [&](PacketView entry) {
        const Reading readings[] = {readingOf(kCountryCode, code(entry, 0)),
                                    readingOf(kNetworkCode, code(entry, 1))};
        elements.add(readings);
    });
}

} // namespace orvane
