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

/// The sections of the technology Ostrel GSM. The fields are the list of sections: see ClassIndex.
class Ostrel_GSMClassIndex final : public ClassIndex {
public:
    /// Prints "Deallocing Ostrel_GSMClassIndex" on the console and releases the sections, the first created
    /// first.
    ~Ostrel_GSMClassIndex() override;

    Held<ActiveSet> objActiveSet{*this};
    Held<CodingScheme> objCodingScheme{*this};
    Held<GPRSInformation> objGPRSInformation{*this};
    Held<GSMServingCell> objGSMServingCell{*this};
    Held<MobileAllocation> objMobileAllocation{*this};
    Held<NeighboringCells> objNeighboringCells{*this};
    Held<PDPContextList> objPDPContextList{*this};
    Held<ProcessPS> objProcessPS{*this};
    Held<UMTSRRMeasurement> objUMTSRRMeasurement{*this};
    Held<CellChangeCounters> objCellChangeCounter{*this};
    Held<DetectedSet> objDetectedSet{*this};
    Held<GSMSet> objGSMSet{*this};
    Held<NonRankedGSMSet> objNonRankedGSMSet{*this};
    Held<ProcessCO> objProcessCO{*this};
    Held<ServingPLMN> objServingPLMN{*this};
    Held<UMTSSet> objUMTSSet{*this};
    Held<EquivalentPLMNList> objEquivalentPLMNList{*this};
    Held<GSMRRInfo> objGSMRRInfo{*this};
    Held<MonitoredSet> objMonitoredSet{*this};
    Held<NonRankedUMTSSet> objNonRankedUMTSSet{*this};
    Held<ProcessCS> objProcessCS{*this};
    Held<UMTSRRInfo> objUMTSRRInfo{*this};
    Held<BLER> objBLER{*this};
    Held<VirtualActiveSet> objVirtualActiveSet{*this};
    Held<SimInfo> objSimInfo{*this};
    Held<HSDPAInformation> objHSDPAInformation{*this};
};

} // namespace velmora
