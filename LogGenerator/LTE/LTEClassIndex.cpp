// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTEClassIndex.h"

#include "Platform/Console.h"

namespace velmora {

template <class Visit>
void LTEClassIndex::forEachField(Visit visit) {
    visit(objLTEServingCellInfo);
    visit(objConnectedModeMeasurementMisc);
    visit(objMeasuredNeighborCells);
    visit(objDetectedCells);
    visit(objServingCellMeasurement);
    visit(objNeighborMeasurementMisc);
    visit(objNeighborCellsList);
    visit(objReselectionCandidatesMisc);
    visit(objReselectionCandidatesList);
    visit(objSimInfo);
    visit(objPDPContextList);
}

LTEClassIndex::LTEClassIndex() {
    forEachField([this](auto& field) { create(field); });
}

LTEClassIndex::~LTEClassIndex() {
    printLine("Deallocing LTEClassIndex");
    forEachField([](auto& field) { field.reset(); });
}

} // namespace velmora
