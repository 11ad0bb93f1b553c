#include "LogGenerator/LTE/Sections.h"

#include "LogGenerator/Formats.h"
#include "LogGenerator/LTE/LogCodes.h"

namespace orvane
{

namespace
{

constexpr Field kFields[] = {
    bytesField("Version", 13, 1, decimal),
    bytesField("Serving EARFCN", 15, 2, decimal),
    bytesField("Serving Cell ID", 17, 2, decimal),
};

constexpr PacketLayout kPackets[] = {
    rowsPacket(kLteReselectionCandidatesCode, 21, kFields),
};

constexpr const char* kName = "Reselection Candidates";
constexpr SectionLayout kLayout = {kName, kName, UnknownCode::Report, kPackets};

} // namespace

ReselectionCandidatesMisc::ReselectionCandidatesMisc() : Section(kLayout) {}

} // namespace orvane
