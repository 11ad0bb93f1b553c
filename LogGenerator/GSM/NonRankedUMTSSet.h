#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Non-Ranked UMTS Set": decodes nothing; it is there for the template to name, and only logs.
class NonRankedUMTSSet final : public ListSection
{
public:
    NonRankedUMTSSet();
};

} // namespace orvane
