#include "LogGenerator/GSM/Sections.h"

#include "LogGenerator/GSM/AlwaysEmptySet.h"

namespace orvane
{

namespace
{

constexpr SectionLayout kLayout = {"Detected Set", "DetectedSet", UnknownCode::Report,
                                   kAlwaysEmptySetPackets};

} // namespace

DetectedSet::DetectedSet() : ListSection(kLayout) {}

} // namespace orvane
