#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "GSM Set": the GSM cells ranked for reselection.
class GSMSet final : public ListSection
{
public:
    GSMSet();
};

} // namespace orvane
