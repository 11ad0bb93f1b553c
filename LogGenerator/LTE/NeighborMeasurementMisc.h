#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Neighbor Measurements": the channel on which neighbours were measured while idle.
class NeighborMeasurementMisc final : public Section
{
public:
    NeighborMeasurementMisc();
};

} // namespace orvane
