#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "GPRS Information": the packet-service options of the GSM cell.
class GPRSInformation final : public Section
{
public:
    GPRSInformation();
};

} // namespace orvane
