#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "UMTS RR Measurement": decodes nothing; it is there for the template to name, and only logs.
class UMTSRRMeasurement final : public Section
{
public:
    UMTSRRMeasurement();
};

} // namespace orvane
