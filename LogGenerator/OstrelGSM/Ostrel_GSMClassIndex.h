#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/OstrelGSM/ActiveSet.h"
#include "LogGenerator/OstrelGSM/BLER.h"
#include "LogGenerator/OstrelGSM/CellChangeCounters.h"
#include "LogGenerator/OstrelGSM/CodingScheme.h"
#include "LogGenerator/OstrelGSM/DetectedSet.h"
#include "LogGenerator/OstrelGSM/EquivalentPLMNList.h"
#include "LogGenerator/OstrelGSM/GPRSInformation.h"
#include "LogGenerator/OstrelGSM/GSMRRInfo.h"
#include "LogGenerator/OstrelGSM/GSMServingCell.h"
#include "LogGenerator/OstrelGSM/GSMSet.h"
#include "LogGenerator/OstrelGSM/HSDPAInformation.h"
#include "LogGenerator/OstrelGSM/MobileAllocation.h"
#include "LogGenerator/OstrelGSM/MonitoredSet.h"
#include "LogGenerator/OstrelGSM/NeighboringCells.h"
#include "LogGenerator/OstrelGSM/NonRankedGSMSet.h"
#include "LogGenerator/OstrelGSM/NonRankedUMTSSet.h"
#include "LogGenerator/OstrelGSM/ProcessCO.h"
#include "LogGenerator/OstrelGSM/ProcessCS.h"
#include "LogGenerator/OstrelGSM/ProcessPS.h"
#include "LogGenerator/OstrelGSM/ServingPLMN.h"
#include "LogGenerator/OstrelGSM/UMTSRRInfo.h"
#include "LogGenerator/OstrelGSM/UMTSRRMeasurement.h"
#include "LogGenerator/OstrelGSM/UMTSSet.h"
#include "LogGenerator/OstrelGSM/VirtualActiveSet.h"
#include "LogGenerator/PDPContextList.h"
#include "LogGenerator/SimInfo.h"

namespace velmora {

/// The sections of the technology Ostrel GSM. The fields stand in the order in which the sections are
/// created, which is the order in which those that share a log code are called.
class Ostrel_GSMClassIndex final : public ClassIndex {
public:
    Ostrel_GSMClassIndex();
    /// Prints "Deallocing Ostrel_GSMClassIndex" on the console and releases the sections, the first created
    /// first.
    ~Ostrel_GSMClassIndex() override;

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

private:
    /// Calls `visit` with every field in order.
    template <class Visit>
    void forEachField(Visit visit);
};

} // namespace velmora
