#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/LogCodes.h"
#include "LogGenerator/GSM/NasTables.h"

namespace orvane
{

namespace
{

// Deliberate: the rows carry the names of the circuit-switched ones, and the update status that of
// a cause.
constexpr Field kGmmFields[] = {
    bytesField("MM State", 13, 1, named<kGmmStates>),
    bytesField("MM Sub State", 14, 1, named<kGmmSubStates>),
    bytesField("Attach Reject Cause", 15, 1, named<kGmmUpdateStatuses>),
};

constexpr Field kRegistrationFields[] = {
    bytesField("MM Service State", 13, 1, named<kRegistrationStates>),
};

constexpr PacketLayout kPackets[] = {
    {kGmmStateCode,     16, kGmmFields         },
    {kRegistrationCode, 16, kRegistrationFields},
};

constexpr SectionLayout kLayout = {"Process PS", "ProcessPS", UnknownCode::Report, kPackets};

} // namespace

ProcessPS::ProcessPS() : Section(kLayout) {}

} // namespace orvane
