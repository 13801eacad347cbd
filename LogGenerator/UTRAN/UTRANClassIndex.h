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

/// The sections of the technology Ostrel UTRAN2. The fields stand in the order in which the sections are
/// created, which is the order in which those that share a log code are called. Its destruction says nothing
/// of its own.
class UTRANClassIndex final : public ClassIndex {
public:
    UTRANClassIndex();

    std::unique_ptr<RRC_State> rrc_state;
    std::unique_ptr<UTRANServingCellInfo> servingCellInfo;
    std::unique_ptr<UTRANNeighbhorMeasurements> tdMeasurements;
    std::unique_ptr<GSMNeighbhorMeasurements> gsmMeasurements;
    std::unique_ptr<TRCHBLERMeasurement> trchMeasurements;
    std::unique_ptr<CCTRCHSIRMeasurement> cctrchMeasurements;
    std::unique_ptr<PDPContextList> pdpList;
    std::unique_ptr<SimInfo> simInfo;
};

} // namespace velmora
