#include "LogGenerator/GSM/VRN_GSMClassIndex.h"

#include "platform/services/Console.h"

namespace orvane
{

void VRN_GSMClassIndex::init()
{
    objActiveSet = make<ActiveSet>();
    objCodingScheme = make<CodingScheme>();
    objGPRSInformation = make<GPRSInformation>();
    objGSMServingCell = make<GSMServingCell>();
    objMobileAllocation = make<MobileAllocation>();
    objNeighboringCells = make<NeighboringCells>();
    objPDPContextList = make<PDPContextList>();
    objProcessPS = make<ProcessPS>();
    objUMTSRRMeasurement = make<UMTSRRMeasurement>();
    objCellChangeCounter = make<CellChangeCounters>();
    objDetectedSet = make<DetectedSet>();
    objGSMSet = make<GSMSet>();
    objNonRankedGSMSet = make<NonRankedGSMSet>();
    objProcessCO = make<ProcessCO>();
    objServingPLMN = make<ServingPLMN>();
    objUMTSSet = make<UMTSSet>();
    objEquivalentPLMNList = make<EquivalentPLMNList>();
    objGSMRRInfo = make<GSMRRInfo>();
    objMonitoredSet = make<MonitoredSet>();
    objNonRankedUMTSSet = make<NonRankedUMTSSet>();
    objProcessCS = make<ProcessCS>();
    objUMTSRRInfo = make<UMTSRRInfo>();
    objBLER = make<BLER>();
    objVirtualActiveSet = make<VirtualActiveSet>();
    objSimInfo = make<SimInfo>();
    objHSDPAInformation = make<HSDPAInformation>();
}

VRN_GSMClassIndex::~VRN_GSMClassIndex()
{
    consoleLine("Deallocing VRN_GSMClassIndex");
    // By name, since members would go in the opposite order.
    objActiveSet.reset();
    objCodingScheme.reset();
    objGPRSInformation.reset();
    objGSMServingCell.reset();
    objMobileAllocation.reset();
    objNeighboringCells.reset();
    objPDPContextList.reset();
    objProcessPS.reset();
    objUMTSRRMeasurement.reset();
    objCellChangeCounter.reset();
    objDetectedSet.reset();
    objGSMSet.reset();
    objNonRankedGSMSet.reset();
    objProcessCO.reset();
    objServingPLMN.reset();
    objUMTSSet.reset();
    objEquivalentPLMNList.reset();
    objGSMRRInfo.reset();
    objMonitoredSet.reset();
    objNonRankedUMTSSet.reset();
    objProcessCS.reset();
    objUMTSRRInfo.reset();
    objBLER.reset();
    objVirtualActiveSet.reset();
    objSimInfo.reset();
    objHSDPAInformation.reset();
}

} // namespace orvane
