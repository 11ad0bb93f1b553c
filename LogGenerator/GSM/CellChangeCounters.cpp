#include "LogGenerator/GSM/Sections.h"

namespace orvane
{

namespace
{

constexpr SectionLayout kLayout = {
    "Cell Change Counters", "CellChangeCounters", UnknownCode::Ignore, {}};

} // namespace

CellChangeCounters::CellChangeCounters() : Section(kLayout) {}

} // namespace orvane
