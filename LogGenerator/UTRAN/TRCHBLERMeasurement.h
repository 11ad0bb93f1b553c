#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "TRCH BLER": the block error rate of each transport channel.
class TRCHBLERMeasurement final : public ListSection
{
public:
    TRCHBLERMeasurement();
};

} // namespace orvane
