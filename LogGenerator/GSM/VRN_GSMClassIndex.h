#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/GSM/ActiveSet.h"
#include "LogGenerator/GSM/BLER.h"
#include "LogGenerator/GSM/CellChangeCounters.h"
#include "LogGenerator/GSM/CodingScheme.h"
#include "LogGenerator/GSM/DetectedSet.h"
#include "LogGenerator/GSM/EquivalentPLMNList.h"
#include "LogGenerator/GSM/GPRSInformation.h"
#include "LogGenerator/GSM/GSMRRInfo.h"
#include "LogGenerator/GSM/GSMServingCell.h"
#include "LogGenerator/GSM/GSMSet.h"
#include "LogGenerator/GSM/HSDPAInformation.h"
#include "LogGenerator/GSM/MobileAllocation.h"
#include "LogGenerator/GSM/MonitoredSet.h"
#include "LogGenerator/GSM/NeighboringCells.h"
#include "LogGenerator/GSM/NonRankedGSMSet.h"
#include "LogGenerator/GSM/NonRankedUMTSSet.h"
#include "LogGenerator/GSM/PDPContextList.h"
#include "LogGenerator/GSM/ProcessCO.h"
#include "LogGenerator/GSM/ProcessCS.h"
#include "LogGenerator/GSM/ProcessPS.h"
#include "LogGenerator/GSM/ServingPLMN.h"
#include "LogGenerator/GSM/SimInfo.h"
#include "LogGenerator/GSM/UMTSRRInfo.h"
#include "LogGenerator/GSM/UMTSRRMeasurement.h"
#include "LogGenerator/GSM/UMTSSet.h"
#include "LogGenerator/GSM/VirtualActiveSet.h"

namespace orvane
{

// The GSM/UMTS sections, in the order in which they are made, called and released.
class VRN_GSMClassIndex final : public ClassIndex
{
public:
    ~VRN_GSMClassIndex() override;
    // Makes and registers the sections.
    void init();

private:
    std::unique_ptr<ActiveSet> objActiveSet;
    std::unique_ptr<CodingScheme> objCodingScheme;
    std::unique_ptr<GPRSInformation> objGPRSInformation;
    std::unique_ptr<GSMServingCell> objGSMServingCell;
    std::unique_ptr<MobileAllocation> objMobileAllocation;
    std::unique_ptr<NeighboringCells> objNeighboringCells;
    std::unique_ptr<PDPContextList> objPDPContextList;
    std::unique_ptr<ProcessPS> objProcessPS;
    std::unique_ptr<UMTSRRMeasurement> objUMTSRRMeasurement;
    std::unique_ptr<CellChangeCounters> objCellChangeCounter;
    std::unique_ptr<DetectedSet> objDetectedSet;
    std::unique_ptr<GSMSet> objGSMSet;
    std::unique_ptr<NonRankedGSMSet> objNonRankedGSMSet;
    std::unique_ptr<ProcessCO> objProcessCO;
    std::unique_ptr<ServingPLMN> objServingPLMN;
    std::unique_ptr<UMTSSet> objUMTSSet;
    std::unique_ptr<EquivalentPLMNList> objEquivalentPLMNList;
    std::unique_ptr<GSMRRInfo> objGSMRRInfo;
    std::unique_ptr<MonitoredSet> objMonitoredSet;
    std::unique_ptr<NonRankedUMTSSet> objNonRankedUMTSSet;
    std::unique_ptr<ProcessCS> objProcessCS;
    std::unique_ptr<UMTSRRInfo> objUMTSRRInfo;
    std::unique_ptr<BLER> objBLER;
    std::unique_ptr<VirtualActiveSet> objVirtualActiveSet;
    std::unique_ptr<SimInfo> objSimInfo;
    std::unique_ptr<HSDPAInformation> objHSDPAInformation;
};

} // namespace orvane
