#include "LogGenerator/UTRAN/UTRANClassIndex.h"

namespace orvane
{

void UTRANClassIndex::init()
{
    rrc_state = make<RRC_State>();
    servingCellInfo = make<UTRANServingCellInfo>();
    tdMeasurements = make<UTRANNeighbhorMeasurements>();
    gsmMeasurements = make<GSMNeighbhorMeasurements>();
    trchMeasurements = make<TRCHBLERMeasurement>();
    cctrchMeasurements = make<CCTRCHSIRMeasurement>();
    pdpList = make<PDPContextList>();
    simInfo = make<SimInfo>();
}

UTRANClassIndex::~UTRANClassIndex()
{
    // By name, since members would go in the opposite order.
    rrc_state.reset();
    servingCellInfo.reset();
    tdMeasurements.reset();
    gsmMeasurements.reset();
    trchMeasurements.reset();
    cctrchMeasurements.reset();
    pdpList.reset();
    simInfo.reset();
}

} // namespace orvane
