// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Extra/PDPContextList.h"
#include "LogGenerator/Extra/SimInfo.h"
#include "LogGenerator/UTRAN/CCTRCHSIRMeasurement.h"
#include "LogGenerator/UTRAN/GSMNeighbhorMeasurements.h"
#include "LogGenerator/UTRAN/RRC_State.h"
#include "LogGenerator/UTRAN/TRCHBLERMeasurement.h"
#include "LogGenerator/UTRAN/UTRANNeighbhorMeasurements.h"
#include "LogGenerator/UTRAN/UTRANServingCellInfo.h"

namespace velmora {

/// The sections of the technology Ostrel UTRAN2. The fields are the list of sections: see ClassIndex. Its
/// destructor prints no line of its own.
class UTRANClassIndex final : public ClassIndex {
public:
    Held<RRC_State> rrc_state{*this};
    Held<UTRANServingCellInfo> servingCellInfo{*this};
    Held<UTRANNeighbhorMeasurements> tdMeasurements{*this};
    Held<GSMNeighbhorMeasurements> gsmMeasurements{*this};
    Held<TRCHBLERMeasurement> trchMeasurements{*this};
    Held<CCTRCHSIRMeasurement> cctrchMeasurements{*this};
    Held<PDPContextList> pdpList{*this};
    Held<SimInfo> simInfo{*this};
};

} // namespace velmora
