#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/GSM/PDPContextList.h"
#include "LogGenerator/GSM/SimInfo.h"
#include "LogGenerator/UTRAN/CCTRCHSIRMeasurement.h"
#include "LogGenerator/UTRAN/GSMNeighbhorMeasurements.h"
#include "LogGenerator/UTRAN/RRC_State.h"
#include "LogGenerator/UTRAN/TRCHBLERMeasurement.h"
#include "LogGenerator/UTRAN/UTRANNeighbhorMeasurements.h"
#include "LogGenerator/UTRAN/UTRANServingCellInfo.h"

namespace orvane
{

// The UTRAN sections, in the order in which they are made, called and released.
class UTRANClassIndex final : public ClassIndex
{
public:
    ~UTRANClassIndex() override;
    // Makes and registers the sections.
    void init();

private:
    std::unique_ptr<RRC_State> rrc_state;
    std::unique_ptr<UTRANServingCellInfo> servingCellInfo;
    std::unique_ptr<UTRANNeighbhorMeasurements> tdMeasurements;
    std::unique_ptr<GSMNeighbhorMeasurements> gsmMeasurements;
    std::unique_ptr<TRCHBLERMeasurement> trchMeasurements;
    std::unique_ptr<CCTRCHSIRMeasurement> cctrchMeasurements;
    std::unique_ptr<PDPContextList> pdpList;
    std::unique_ptr<SimInfo> simInfo;
};

} // namespace orvane
