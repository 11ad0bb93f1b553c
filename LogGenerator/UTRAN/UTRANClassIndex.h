#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/GSM/Sections.h"
#include "LogGenerator/UTRAN/Sections.h"

namespace orvane
{

// The UTRAN sections, in the order in which they are made, called and released.
class UTRANClassIndex final : public ClassIndex
{
public:
    ~UTRANClassIndex() override { releaseSections(); }

private:
    Owned<RRC_State> rrc_state{*this};
    Owned<UTRANServingCellInfo> servingCellInfo{*this};
    Owned<UTRANNeighbhorMeasurements> tdMeasurements{*this};
    Owned<GSMNeighbhorMeasurements> gsmMeasurements{*this};
    Owned<TRCHBLERMeasurement> trchMeasurements{*this};
    Owned<CCTRCHSIRMeasurement> cctrchMeasurements{*this};
    Owned<PDPContextList> pdpList{*this};
    Owned<SimInfo> simInfo{*this};
};

} // namespace orvane
