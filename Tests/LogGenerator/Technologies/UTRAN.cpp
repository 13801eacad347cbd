// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Tests/LogGenerator/Technologies/Technologies.h"

namespace velmora {

Technology expectedUTRAN() {
    using Index = UTRANClassIndex;
    return {
        .name = "UTRAN",
        .makeIndex = std::make_unique<Index>,
        .sections =
            {
                {"RRC Info", held<&Index::rrc_state>, {0xD0E0}},
                {"Serving Cell Info", held<&Index::servingCellInfo>, {0xD0E2, 0xFF0001}},
                {"Neighbor Cell List", held<&Index::tdMeasurements>, {0xD00A}, "NeighbhorMeasurements List"},
                {"GSM Neighbor Cell List", held<&Index::gsmMeasurements>, {0xD00E}},
                {"TRCH BLER",
                 held<&Index::trchMeasurements>,
                 {0xD00C},
                 "TRCH BLER Measurement",
                 LogPriority::Notice},
                {"CCTRCH SIR", held<&Index::cctrchMeasurements>, {0xD00C}, "CCTRCH SIR Measurement"},
                contextList(held<&Index::pdpList>),
                simInfo(held<&Index::simInfo>),
            },
        .noSection = "RRC_State",
        .consoleAtEnd = "Deallocing ClassIndex\n",
    };
}

} // namespace velmora
