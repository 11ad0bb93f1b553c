#include "LogGenerator/LTE/LTEClassIndex.h"

#include "platform/services/Console.h"

namespace orvane
{

void LTEClassIndex::init()
{
    objLTEServingCellInfo = make<LTEServingCellInfo>();
    objConnectedModeMeasurementMisc = make<ConnectedModeMeasurementMisc>();
    objMeasuredNeighborCells = make<MeasuredNeighborCells>();
    objDetectedCells = make<DetectedCells>();
    objServingCellMeasurement = make<ServingCellMeasurement>();
    objNeighborMeasurementMisc = make<NeighborMeasurementMisc>();
    objNeighborCellsList = make<NeighborCellsList>();
    objReselectionCandidatesMisc = make<ReselectionCandidatesMisc>();
    objReselectionCandidatesList = make<ReselectionCandidatesList>();
    objSimInfo = make<SimInfo>();
    objPDPContextList = make<PDPContextList>();
}

LTEClassIndex::~LTEClassIndex()
{
    consoleLine("Deallocing LTEClassIndex");
    // By name, since members would go in the opposite order.
    objLTEServingCellInfo.reset();
    objConnectedModeMeasurementMisc.reset();
    objMeasuredNeighborCells.reset();
    objDetectedCells.reset();
    objServingCellMeasurement.reset();
    objNeighborMeasurementMisc.reset();
    objNeighborCellsList.reset();
    objReselectionCandidatesMisc.reset();
    objReselectionCandidatesList.reset();
    objSimInfo.reset();
    objPDPContextList.reset();
}

} // namespace orvane
