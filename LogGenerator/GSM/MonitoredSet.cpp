#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/AlwaysEmptySet.h"

namespace orvane
{

namespace
{

constexpr SectionLayout kLayout = {"Monitored Set", "MonitoredSet", UnknownCode::Report,
                                   kAlwaysEmptySetPackets};

} // namespace

MonitoredSet::MonitoredSet() : ListSection(kLayout) {}

} // namespace orvane
