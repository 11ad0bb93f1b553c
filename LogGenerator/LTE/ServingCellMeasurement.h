#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Serving Cell Measurements": the serving cell as measured while idle, and the rules for measuring
// others.
class ServingCellMeasurement final : public Section
{
public:
    ServingCellMeasurement();
};

} // namespace orvane
