#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/AlwaysEmptySet.h"

namespace orvane
{

namespace
{

constexpr SectionLayout kLayout = {"Virtual Active Set", "VirtualActiveSet", UnknownCode::Report,
                                   kAlwaysEmptySetPackets};

} // namespace

VirtualActiveSet::VirtualActiveSet() : ListSection(kLayout) {}

} // namespace orvane
