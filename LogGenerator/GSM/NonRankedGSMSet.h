#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Non-Ranked GSM Set": decodes nothing; it is there for the template to name, and only logs.
class NonRankedGSMSet final : public ListSection
{
public:
    NonRankedGSMSet();
};

} // namespace orvane
