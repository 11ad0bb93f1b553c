#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Neighbor Cell List": the neighbours of the same technology.
class UTRANNeighbhorMeasurements final : public ListSection
{
public:
    UTRANNeighbhorMeasurements();
};

} // namespace orvane
