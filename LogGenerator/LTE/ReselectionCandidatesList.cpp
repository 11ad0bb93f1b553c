#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/LTE/LogCodes.h"
#include "platform/base/PropertyValue.h"

#include <algorithm>
#include <iterator>

namespace orvane
{

namespace
{

// What follows a candidate's header of 4 bytes, by its technology.
constexpr Field kLteFields[] = {
    bytesField("E ARFCN", 4, 2, decimal),
    bitsField("Cell ID", 6, 7, 9, decimal),
};
constexpr Field kUtranFields[] = {
    bytesField("U ARFCN", 4, 2, decimal),
    bytesField("PSC", 6, 2, decimal),
};
constexpr Field kGeranFields[] = {
    bytesField("ARFCN", 4, 2, decimal),
    bytesField("Band", 6, 1, decimal),
    bytesField("BSIC ID", 7, 1, decimal),
};
constexpr Field kCdmaFields[] = {
    bytesField("Band", 4, 1, decimal),
    bytesField("Channel", 8, 2, decimal),
    bytesField("Pilot", 10, 2, decimal),
};

// By the number that stands for the technology.
constexpr ValueName kTechnologies[] = {
    {0, "LTE"      },
    {1, "UTRAN"    },
    {2, "GERAN"    },
    {3, "CDMA1XRTT"},
    {4, "CDMAHRPD" },
};
constexpr std::span<const Field> kBodies[] = {kLteFields, kUtranFields, kGeranFields, kCdmaFields,
                                              kCdmaFields};
static_assert(std::size(kBodies) == std::size(kTechnologies));
constexpr Format kTechnologyName = namesFormat(kTechnologies, "??");

constexpr Field kTechnologyField = bytesField("Candidate RAT Type", 2, 2, kTechnologyName);
constexpr Field kHeaderFields[] = {
    bytesField("Candidate Priority", 0, 2, decimal),
    kTechnologyField,
};

std::span<const Field> bodyFields(PacketView record)
{
    const auto technology = kTechnologyField.valueIn(record);
    return technology && *technology < std::ssize(kBodies) ? kBodies[*technology]
                                                           : std::span<const Field>();
}

// Deliberate: the count has 16 bits at 19, of which only the low byte is walked.
// Deliberate: candidates stand 4 bytes apart, so that one's body lies where the next one's header
// is.
constexpr RecordLayout kCandidates = {countAt<19>, startAt<21>, 4, kHeaderFields};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kLteReselectionCandidatesCode, 21, kCandidates),
};

constexpr const char* kName = "Reselection Candidates List";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Report, kPackets};

} // namespace

ReselectionCandidatesList::ReselectionCandidatesList() : ListSection(kLayout) {}

void ReselectionCandidatesList::fill(ListElements& elements, PacketView packet,
                                     const PacketLayout& layout)
{
    const auto wholeBytes = [](PacketView record) {
        return std::max(bytesRead(kHeaderFields), bytesRead(bodyFields(record)));
    };
    forEachWholeRecord(layout.records->in(packet), wholeBytes, [&](PacketView record) {
        elements.add(record, kHeaderFields, bodyFields(record));
    });
}

} // namespace orvane
