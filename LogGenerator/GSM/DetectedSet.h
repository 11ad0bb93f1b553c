#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Detected Set": a list that stays empty (LogGenerator/GSM/AlwaysEmptySet.h).
class DetectedSet final : public ListSection
{
public:
    DetectedSet();
};

} // namespace orvane
