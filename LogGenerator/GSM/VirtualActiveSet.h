#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Virtual Active Set": a list that stays empty (LogGenerator/GSM/AlwaysEmptySet.h).
class VirtualActiveSet final : public ListSection
{
public:
    VirtualActiveSet();
};

} // namespace orvane
