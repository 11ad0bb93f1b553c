#include "LogGenerator/GSM/Sections.h"

namespace orvane
{

namespace
{

constexpr SectionLayout kLayout = {
    "Non-Ranked GSM Set", "NonRankedGSMSet", UnknownCode::Ignore, {}};

} // namespace

NonRankedGSMSet::NonRankedGSMSet() : ListSection(kLayout) {}

} // namespace orvane
