#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Cell Change Counters": decodes nothing; it is there for the template to name, and only logs.
class CellChangeCounters final : public Section
{
public:
    CellChangeCounters();
};

} // namespace orvane
