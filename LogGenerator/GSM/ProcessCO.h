#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Process CO": the mobility management state that both services share.
class ProcessCO final : public Section
{
public:
    ProcessCO();
};

} // namespace orvane
