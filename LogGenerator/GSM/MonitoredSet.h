#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Monitored Set": a list that stays empty (LogGenerator/GSM/AlwaysEmptySet.h).
class MonitoredSet final : public ListSection
{
public:
    MonitoredSet();
};

} // namespace orvane
