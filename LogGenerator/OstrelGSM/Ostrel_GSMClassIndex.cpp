// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Ostrel_GSMClassIndex.h"

#include "Platform/Console.h"

namespace velmora {

template <class Visit>
void Ostrel_GSMClassIndex::forEachField(Visit visit) {
    visit(objActiveSet);
    visit(objCodingScheme);
    visit(objGPRSInformation);
    visit(objGSMServingCell);
    visit(objMobileAllocation);
    visit(objNeighboringCells);
    visit(objPDPContextList);
    visit(objProcessPS);
    visit(objUMTSRRMeasurement);
    visit(objCellChangeCounter);
    visit(objDetectedSet);
    visit(objGSMSet);
    visit(objNonRankedGSMSet);
    visit(objProcessCO);
    visit(objServingPLMN);
    visit(objUMTSSet);
    visit(objEquivalentPLMNList);
    visit(objGSMRRInfo);
    visit(objMonitoredSet);
    visit(objNonRankedUMTSSet);
    visit(objProcessCS);
    visit(objUMTSRRInfo);
    visit(objBLER);
    visit(objVirtualActiveSet);
    visit(objSimInfo);
    visit(objHSDPAInformation);
}

Ostrel_GSMClassIndex::Ostrel_GSMClassIndex() {
    forEachField([this](auto& field) { create(field); });
}

Ostrel_GSMClassIndex::~Ostrel_GSMClassIndex() {
    printLine("Deallocing Ostrel_GSMClassIndex");
    forEachField([](auto& field) { field.reset(); });
}

} // namespace velmora
