#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/LogCodes.h"
#include "LogGenerator/GSM/NasTables.h"

namespace orvane
{

namespace
{

constexpr Field kMmFields[] = {
    bytesField("MM State", 13, 1, named<kMmStates>),
};

constexpr Field kRegistrationFields[] = {
    bytesField("MM Service State", 13, 1, named<kRegistrationStates>),
};

constexpr PacketLayout kPackets[] = {
    {kMmStateCode,      16, kMmFields          },
    {kRegistrationCode, 16, kRegistrationFields},
};

// Deliberate: logs as the circuit-switched section does.
constexpr SectionLayout kLayout = {"Process CO", "ProcessCS", UnknownCode::Report, kPackets};

} // namespace

ProcessCO::ProcessCO() : Section(kLayout) {}

} // namespace orvane
