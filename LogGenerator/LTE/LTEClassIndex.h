#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/GSM/Sections.h"
#include "LogGenerator/LTE/Sections.h"
#include "platform/services/Console.h"

namespace orvane
{

// The LTE sections, in the order in which they are made, called and released.
class LTEClassIndex final : public ClassIndex
{
public:
    ~LTEClassIndex() override
    {
        consoleLine("Deallocing LTEClassIndex");
        releaseSections();
    }

private:
    Owned<LTEServingCellInfo> objLTEServingCellInfo{*this};
    Owned<ConnectedModeMeasurementMisc> objConnectedModeMeasurementMisc{*this};
    Owned<MeasuredNeighborCells> objMeasuredNeighborCells{*this};
    Owned<DetectedCells> objDetectedCells{*this};
    Owned<ServingCellMeasurement> objServingCellMeasurement{*this};
    Owned<NeighborMeasurementMisc> objNeighborMeasurementMisc{*this};
    Owned<NeighborCellsList> objNeighborCellsList{*this};
    Owned<ReselectionCandidatesMisc> objReselectionCandidatesMisc{*this};
    Owned<ReselectionCandidatesList> objReselectionCandidatesList{*this};
    Owned<SimInfo> objSimInfo{*this};
    Owned<PDPContextList> objPDPContextList{*this};
};

} // namespace orvane
