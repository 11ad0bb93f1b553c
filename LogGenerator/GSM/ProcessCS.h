#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Process CS": mobility management and registration for circuit-switched service.
class ProcessCS final : public Section
{
public:
    ProcessCS();
};

} // namespace orvane
