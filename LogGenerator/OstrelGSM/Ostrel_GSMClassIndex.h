// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Extra/PDPContextList.h"
#include "LogGenerator/Extra/SimInfo.h"
#include "LogGenerator/OstrelGSM/GSM/CellChangeCounters.h"
#include "LogGenerator/OstrelGSM/GSM/CodingScheme.h"
#include "LogGenerator/OstrelGSM/GSM/GPRSInformation.h"
#include "LogGenerator/OstrelGSM/GSM/GSMRRInfo.h"
#include "LogGenerator/OstrelGSM/GSM/GSMServingCell.h"
#include "LogGenerator/OstrelGSM/GSM/GSMSet.h"
#include "LogGenerator/OstrelGSM/GSM/MobileAllocation.h"
#include "LogGenerator/OstrelGSM/GSM/NeighboringCells.h"
#include "LogGenerator/OstrelGSM/GSM/NonRankedGSMSet.h"
#include "LogGenerator/OstrelGSM/Registration/EquivalentPLMNList.h"
#include "LogGenerator/OstrelGSM/Registration/ProcessCO.h"
#include "LogGenerator/OstrelGSM/Registration/ProcessCS.h"
#include "LogGenerator/OstrelGSM/Registration/ProcessPS.h"
#include "LogGenerator/OstrelGSM/Registration/ServingPLMN.h"
#include "LogGenerator/OstrelGSM/UMTS/ActiveSet.h"
#include "LogGenerator/OstrelGSM/UMTS/BLER.h"
#include "LogGenerator/OstrelGSM/UMTS/DetectedSet.h"
#include "LogGenerator/OstrelGSM/UMTS/HSDPAInformation.h"
#include "LogGenerator/OstrelGSM/UMTS/MonitoredSet.h"
#include "LogGenerator/OstrelGSM/UMTS/NonRankedUMTSSet.h"
#include "LogGenerator/OstrelGSM/UMTS/UMTSRRInfo.h"
#include "LogGenerator/OstrelGSM/UMTS/UMTSRRMeasurement.h"
#include "LogGenerator/OstrelGSM/UMTS/UMTSSet.h"
#include "LogGenerator/OstrelGSM/UMTS/VirtualActiveSet.h"

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
