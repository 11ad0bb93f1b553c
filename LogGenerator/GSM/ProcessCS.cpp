#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/LogCodes.h"
#include "LogGenerator/GSM/NasTables.h"

namespace orvane
{

namespace
{

constexpr Field kMmFields[] = {
    bytesField("MM State", 13, 1, named<kMmStates>),
    bytesField("MM Sub State", 14, 1, named<kMmSubStates>),
    // Deliberate: named a cause, although it is the update status.
    bytesField("LU Reject Cause", 15, 1, named<kLocationUpdateStatuses>),
};

constexpr Field kRegistrationFields[] = {
    bytesField("MM Service State", 13, 1, named<kRegistrationStates>),
};

constexpr PacketLayout kPackets[] = {
    {kMmStateCode,      16, kMmFields          },
    {kRegistrationCode, 16, kRegistrationFields},
};

constexpr SectionLayout kLayout = {"Process CS", "ProcessCS", UnknownCode::Report, kPackets};

} // namespace

ProcessCS::ProcessCS() : Section(kLayout) {}

} // namespace orvane
