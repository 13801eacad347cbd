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

/// The sections of the technology Ostrel LTE. The fields are the list of sections: see ClassIndex.
class LTEClassIndex final : public ClassIndex {
public:
    /// Prints "Deallocing LTEClassIndex" on the console and releases the sections, the first created first.
    ~LTEClassIndex() override;

    Held<LTEServingCellInfo> objLTEServingCellInfo{*this};
    Held<ConnectedModeMeasurementMisc> objConnectedModeMeasurementMisc{*this};
    Held<MeasuredNeighborCells> objMeasuredNeighborCells{*this};
    Held<DetectedCells> objDetectedCells{*this};
    Held<ServingCellMeasurement> objServingCellMeasurement{*this};
    Held<NeighborMeasurementMisc> objNeighborMeasurementMisc{*this};
    Held<NeighborCellsList> objNeighborCellsList{*this};
    Held<ReselectionCandidatesMisc> objReselectionCandidatesMisc{*this};
    Held<ReselectionCandidatesList> objReselectionCandidatesList{*this};
    Held<SimInfo> objSimInfo{*this};
    Held<PDPContextList> objPDPContextList{*this};
};

} // namespace velmora
