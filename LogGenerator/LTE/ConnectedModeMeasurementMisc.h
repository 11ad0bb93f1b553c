#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Connected mode LTE Intra-frequency Measurement": the serving cell as measured while connected.
class ConnectedModeMeasurementMisc final : public Section
{
public:
    ConnectedModeMeasurementMisc();
};

} // namespace orvane
