// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Extra/PDPContextList.h"
#include "LogGenerator/Extra/SimInfo.h"
#include "LogGenerator/LTE/ConnectedModeMeasurementMisc.h"
#include "LogGenerator/LTE/DetectedCells.h"
#include "LogGenerator/LTE/LTEServingCellInfo.h"
#include "LogGenerator/LTE/MeasuredNeighborCells.h"
#include "LogGenerator/LTE/NeighborCellsList.h"
#include "LogGenerator/LTE/NeighborMeasurementMisc.h"
#include "LogGenerator/LTE/ReselectionCandidatesList.h"
#include "LogGenerator/LTE/ReselectionCandidatesMisc.h"
#include "LogGenerator/LTE/ServingCellMeasurement.h"

namespace velmora {

/// The sections of the technology Ostrel LTE. The fields stand in the order in which the sections are
/// created, which is the order in which those that share a log code are called.
class LTEClassIndex final : public ClassIndex {
public:
    LTEClassIndex();
    /// Prints "Deallocing LTEClassIndex" on the console and releases the sections, the first created first.
    ~LTEClassIndex() override;

    std::unique_ptr<LTEServingCellInfo> objLTEServingCellInfo;
    std::unique_ptr<ConnectedModeMeasurementMisc> objConnectedModeMeasurementMisc;
    std::unique_ptr<MeasuredNeighborCells> objMeasuredNeighborCells;
    std::unique_ptr<DetectedCells> objDetectedCells;
    std::unique_ptr<ServingCellMeasurement> objServingCellMeasurement;
    std::unique_ptr<NeighborMeasurementMisc> objNeighborMeasurementMisc;
    std::unique_ptr<NeighborCellsList> objNeighborCellsList;
    std::unique_ptr<ReselectionCandidatesMisc> objReselectionCandidatesMisc;
    std::unique_ptr<ReselectionCandidatesList> objReselectionCandidatesList;
    std::unique_ptr<SimInfo> objSimInfo;
    std::unique_ptr<PDPContextList> objPDPContextList;

private:
    /// Calls `visit` with every field in order.
    template <class Visit>
    void forEachField(Visit visit);
};

} // namespace velmora
