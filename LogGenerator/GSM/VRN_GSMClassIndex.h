#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/GSM/Sections.h"
#include "platform/services/Console.h"

namespace orvane
{

// The GSM/UMTS sections, in the order in which they are made, called and released.
class VRN_GSMClassIndex final : public ClassIndex
{
public:
    ~VRN_GSMClassIndex() override
    {
        consoleLine("Deallocing VRN_GSMClassIndex");
        releaseSections();
    }

private:
    Owned<ActiveSet> objActiveSet{*this};
    Owned<CodingScheme> objCodingScheme{*this};
    Owned<GPRSInformation> objGPRSInformation{*this};
    Owned<GSMServingCell> objGSMServingCell{*this};
    Owned<MobileAllocation> objMobileAllocation{*this};
    Owned<NeighboringCells> objNeighboringCells{*this};
    Owned<PDPContextList> objPDPContextList{*this};
    Owned<ProcessPS> objProcessPS{*this};
    Owned<UMTSRRMeasurement> objUMTSRRMeasurement{*this};
    Owned<CellChangeCounters> objCellChangeCounter{*this};
    Owned<DetectedSet> objDetectedSet{*this};
    Owned<GSMSet> objGSMSet{*this};
    Owned<NonRankedGSMSet> objNonRankedGSMSet{*this};
    Owned<ProcessCO> objProcessCO{*this};
    Owned<ServingPLMN> objServingPLMN{*this};
    Owned<UMTSSet> objUMTSSet{*this};
    Owned<EquivalentPLMNList> objEquivalentPLMNList{*this};
    Owned<GSMRRInfo> objGSMRRInfo{*this};
    Owned<MonitoredSet> objMonitoredSet{*this};
    Owned<NonRankedUMTSSet> objNonRankedUMTSSet{*this};
    Owned<ProcessCS> objProcessCS{*this};
    Owned<UMTSRRInfo> objUMTSRRInfo{*this};
    Owned<BLER> objBLER{*this};
    Owned<VirtualActiveSet> objVirtualActiveSet{*this};
    Owned<SimInfo> objSimInfo{*this};
    Owned<HSDPAInformation> objHSDPAInformation{*this};
};

} // namespace orvane
