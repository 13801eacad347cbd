// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/LTE/LTEClassIndex.h"
#include "LogGenerator/LTE/LTELogGenerator.h"
#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/LogGenerator/Technologies/Technologies.h"

namespace velmora {

Technology expectedLTE() {
    using Index = LTEClassIndex;
    return {
        .name = "LTE",
        .constant = kVoxLogChannelTechnology_Ostrel_LTE,
        .templateName = "LTE",
        .makeIndex = std::make_unique<Index>,
        .sections =
            {
                {"Serving Cell Info",
                 held<&Index::objLTEServingCellInfo>,
                 {0xB0C2, 0xB0C1, 0xFF0001},
                 "LTE Serving Cell Info"},
                {"Connected mode LTE Intra-frequency Measurement",
                 held<&Index::objConnectedModeMeasurementMisc>,
                 {0xB179}},
                {"Measured Neighbor Cells", held<&Index::objMeasuredNeighborCells>, {0xB179}},
                {"Detected Cells", held<&Index::objDetectedCells>, {0xB179}},
                {"Serving Cell Measurements", held<&Index::objServingCellMeasurement>, {0xB17F}},
                {"Neighbor Measurements", held<&Index::objNeighborMeasurementMisc>, {0xB180}},
                {"Neighbor Cells List", held<&Index::objNeighborCellsList>, {0xB180}},
                {"Reselection Candidates", held<&Index::objReselectionCandidatesMisc>, {0xB186}},
                {"Reselection Candidates List", held<&Index::objReselectionCandidatesList>, {0xB186}},
                simInfo(held<&Index::objSimInfo>),
                contextList(held<&Index::objPDPContextList>),
            },
        .noSection = "LTE Serving Cell Info",
        .consoleAtEnd = "Deallocing LTEClassIndex\nDeallocing ClassIndex\n",
        .lists = {"Measured Neighbor Cells", "Detected Cells", "Neighbor Cells List",
                  "Reselection Candidates List", "PDP Context Info"},
        .silent = {},
        .groups = {"Serving Cell", "Idle Mode Neighbors", "Reselection", "Connected Mode", "Packet Data"},
        .longestShort = 20,
        .shortLines = {},
        .full = recordWith(0, 300, {{19, 1}, {27, 1}, {28, 1}}),
        .cells = cellInfo({cell("LTE", "Serving")}),
        .fullLines = {{0xB0C1, 2}, // the antennas are reported as an unknown message, too
                      {0xB180, testing::AnyOf(1u, 8u)}, // the list logs what it holds
                      {0xFF0001, 6}},                   // what the cell lacks
        .decoder =
            {
                .another = anotherLike<LTELogGenerator>,
                .firstLine = {LogPriority::Error, "Creating LTELogGenerator object"},
                // The base class, which is at the same address, has one wording for every technology.
                .destruction = {"LTELogGenerator", "Ostrel_GSMLogGenerator"},
                .record = recordWith(0xB0C1, 22, {{20, 2}}),
                .group = "Serving Cell",
                .section = "Serving Cell Info",
                .node = "{Num Tx Antennas '2'}",
            },
    };
}

} // namespace velmora
