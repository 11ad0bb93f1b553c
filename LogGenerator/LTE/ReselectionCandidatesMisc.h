#pragma once

#include "LogGenerator/Section.h"

namespace orvane
{

// "Reselection Candidates": the serving cell while candidates for reselection are ranked.
class ReselectionCandidatesMisc final : public Section
{
public:
    ReselectionCandidatesMisc();
};

} // namespace orvane
