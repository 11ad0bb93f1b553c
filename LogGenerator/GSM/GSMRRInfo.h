#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "GSM RR Info": the GSM radio-resource state and the quality of the serving cell.
class GSMRRInfo final : public Section
{
public:
    GSMRRInfo();
};

} // namespace orvane
