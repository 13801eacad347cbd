// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "LogGenerator/UTRAN/UTRANLogGenerator.h"
#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/LogGenerator/Technologies/Technologies.h"
#include "Tests/Support/Hex.h"

namespace velmora {

Technology expectedUTRAN() {
    using Index = UTRANClassIndex;
    return {
        .name = "UTRAN",
        .constant = kVoxLogChannelTechnology_Ostrel_UTRAN2,
        .templateName = "Ostrel_UTRAN",
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
        .lists = {"Neighbor Cell List", "GSM Neighbor Cell List", "TRCH BLER", "CCTRCH SIR",
                  "PDP Context Info"},
        .silent = {"RRC Info", "Serving Cell Info", "Neighbor Cell List", "GSM Neighbor Cell List",
                   "TRCH BLER", "CCTRCH SIR"},
        .groups = {"Serving Cell", "Neighbors", "Channel Quality"},
        .longestShort = 14,
        .shortLines = {{0xD0E0, 3},    // the length and the state, both as warnings
                       {0xFF0001, 2}}, // the cells cannot be read
        .full = recordWith(0, 3000, {{13, 1}, {14, 0xFF}, {15, 0xFF}, {16, 0xFF}}),
        .cells = cellInfo({cell("UTRAN", "Serving")}),
        .fullLines = {{0xD0E0, 2},    // the state
                      {0xFF0001, 6}}, // what the cell lacks
        .decoder =
            {
                .another = anotherLike<UTRANLogGenerator>,
                .firstLine = {LogPriority::Warning, "Array Count: 1"},
                // The line of the base class alone.
                .destruction = {"Ostrel_GSMLogGenerator"},
                .record = record(0xD0E0, "01 04"),
                .group = "Serving Cell",
                .section = "RRC Info",
                .node = "{State 'Cell PCH'}",
            },
    };
}

} // namespace velmora
