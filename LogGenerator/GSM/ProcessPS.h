#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Process PS": mobility management and registration for packet-switched service.
class ProcessPS final : public Section
{
public:
    ProcessPS();
};

} // namespace orvane
