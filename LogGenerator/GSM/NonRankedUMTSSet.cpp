#include "LogGenerator/GSM/Sections.h"

namespace orvane
{

namespace
{

constexpr SectionLayout kLayout = {
    "Non-Ranked UMTS Set", "NonRankedUMTSSet", UnknownCode::Ignore, {}};

} // namespace

NonRankedUMTSSet::NonRankedUMTSSet() : ListSection(kLayout) {}

} // namespace orvane
