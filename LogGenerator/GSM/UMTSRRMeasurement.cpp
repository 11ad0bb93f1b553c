#include "LogGenerator/GSM/Sections.h"

namespace orvane
{

namespace
{

constexpr SectionLayout kLayout = {
    "UMTS RR Measurement", "UMTSRRMeasurement", UnknownCode::Ignore, {}};

} // namespace

UMTSRRMeasurement::UMTSRRMeasurement() : Section(kLayout) {}

} // namespace orvane
