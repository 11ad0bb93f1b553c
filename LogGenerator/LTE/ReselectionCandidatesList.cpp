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

struct Technology {
    const char* name;
    std::span<const Field> fields;
};
constexpr Technology kTechnologies[] = {
  // By the number that stands for it.
    {"LTE",       kLteFields  },
    {"UTRAN",     kUtranFields},
    {"GERAN",     kGeranFields},
    {"CDMA1XRTT", kCdmaFields },
    {"CDMAHRPD",  kCdmaFields },
};
constexpr Technology kUnknownTechnology = {"??", {}};

constexpr const Technology& technologyOf(std::int64_t raw)
{
    return raw < std::ssize(kTechnologies) ? kTechnologies[raw] : kUnknownTechnology;
}

RowText technologyName(std::int64_t raw) { return technologyOf(raw).name; }

constexpr Field kTechnologyField = bytesField("Candidate RAT Type", 2, 2, technologyName);
constexpr Field kHeaderFields[] = {
    bytesField("Candidate Priority", 0, 2, decimal),
    kTechnologyField,
};

std::span<const Field> bodyFields(PacketView record)
{
    const auto technology = kTechnologyField.valueIn(record);
    return technology ? technologyOf(*technology).fields : std::span<const Field>();
}

// The count has 16 bits at 19, of which only the low byte is walked. This is meant.
// Candidates stand 4 bytes apart, so that one's body lies where the next one's header is. This is
// meant.
constexpr RecordLayout kCandidates = {countAt<19>, startAt<21>, 4, kHeaderFields};

constexpr PacketLayout kPackets[] = {
    recordsPacket(kLteReselectionCandidatesCode, 21, kCandidates),
};

constexpr const char* kName = "Reselection Candidates List";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Report, kPackets};

} // namespace

ReselectionCandidatesList::ReselectionCandidatesList() : ListSection(kLayout) {}

std::vector<PropertyValue> ReselectionCandidatesList::elements(PacketView packet,
                                                               const PacketLayout& layout)
{
    std::vector<PropertyValue> candidates;
    const auto wholeBytes = [](PacketView record) {
        return std::max(bytesRead(kHeaderFields), bytesRead(bodyFields(record)));
    };
    forEachWholeRecord(layout.records->in(packet), wholeBytes, [&](PacketView record) {
        candidates.push_back(PropertyValue::newDictionary());
        writeRows(candidates.back().asDictionary(), record, kHeaderFields);
        writeRows(candidates.back().asDictionary(), record, bodyFields(record));
    });
    return candidates;
}

} // namespace orvane
