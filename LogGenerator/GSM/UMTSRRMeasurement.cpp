#include "LogGenerator/GSM/UMTSRRMeasurement.h"

namespace orvane
{

namespace
{

constexpr SectionLayout kLayout = {
    "UMTS RR Measurement", "UMTSRRMeasurement", UnknownCode::Ignore, {}};

} // namespace

UMTSRRMeasurement::UMTSRRMeasurement() : Section(kLayout) {}

} // namespace orvane
