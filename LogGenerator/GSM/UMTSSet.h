#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "UMTS Set": the UMTS cells ranked for reselection, or the neighbours that the telephony server
// reports, whichever came last.
class UMTSSet final : public ListSection
{
public:
    UMTSSet();
};

} // namespace orvane
