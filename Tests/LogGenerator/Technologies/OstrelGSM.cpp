// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelGSM/Ostrel_GSMClassIndex.h"
#include "LogGenerator/OstrelGSM/Ostrel_GSMLogGenerator.h"
#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/LogGenerator/Technologies/Technologies.h"
#include "Tests/Support/Hex.h"

namespace velmora {

Technology expectedOstrelGSM() {
    using Index = Ostrel_GSMClassIndex;
    return {
        .name = "OstrelGSM",
        .constant = kVoxLogChannelTechnology_Ostrel_GSM,
        .templateName = "Ostrel_GSM",
        .makeIndex = std::make_unique<Index>,
        .sections =
            {
                {"Active Set", held<&Index::objActiveSet>, {0x417A}, "ActiveSet"},
                {"Coding Scheme",
                 held<&Index::objCodingScheme>,
                 {},
                 "CellChangeCounters"}, // the trace word of another, meant so
                {"GPRS Information",
                 held<&Index::objGPRSInformation>,
                 {0x51F5, 0x7135, 0x51F6, 0x51FB, 0x51FD, 0x51F4, 0x5137},
                 "GPRSInformation"},
                {"GSM Serving Cell",
                 held<&Index::objGSMServingCell>,
                 {0x5134, 0x5137, 0x5076, 0xFF0001},
                 "GSMServingCell"},
                {"Mobile Allocation", held<&Index::objMobileAllocation>, {0x51F8}, "MobileAllocation"},
                {"Neighboring Cells",
                 held<&Index::objNeighboringCells>,
                 {0x5137, 0x51FF, 0xFF0001},
                 "NeighboringCells"},
                contextList(held<&Index::objPDPContextList>),
                {"Process PS", held<&Index::objProcessPS>, {0x7130, 0x7132}, "ProcessPS"},
                {"UMTS RR Measurement", held<&Index::objUMTSRRMeasurement>, {}, "UMTSRRMeasurement"},
                {"Cell Change Counters", held<&Index::objCellChangeCounter>, {}, "CellChangeCounters"},
                {"Detected Set", held<&Index::objDetectedSet>, {0x417A}, "DetectedSet"},
                {"GSM Set", held<&Index::objGSMSet>, {0x4005}, "GSMSet"},
                {"Non-Ranked GSM Set", held<&Index::objNonRankedGSMSet>, {}, "NonRankedGSMSet"},
                {"Process CO", held<&Index::objProcessCO>, {0x7131, 0x7132}, "ProcessCS"}, // as above
                {"Serving PLMN", held<&Index::objServingPLMN>, {0x7135, 0x7132, 0xFF0001}},
                {"UMTS Set", held<&Index::objUMTSSet>, {0x4005, 0xFF0001}, "UMTSSet"},
                {"Equivalent PLMN List", held<&Index::objEquivalentPLMNList>, {0x7150}},
                {"GSM RR Info", held<&Index::objGSMRRInfo>, {0x512C, 0x5137, 0x5072, 0x51F6}, "GSMRRInfo"},
                {"Monitored Set", held<&Index::objMonitoredSet>, {0x417A}, "MonitoredSet"},
                {"Non-Ranked UMTS Set", held<&Index::objNonRankedUMTSSet>, {}, "NonRankedUMTSSet"},
                {"Process CS", held<&Index::objProcessCS>, {0x7131, 0x7132}, "ProcessCS"},
                {"UMTS RR Info",
                 held<&Index::objUMTSRRInfo>,
                 {0x4125, 0x4031, 0x4127, 0x4157, 0xFF0001},
                 "UMTSRRInfo"},
                {"BLER", held<&Index::objBLER>, {0x4116}},
                {"Virtual Active Set", held<&Index::objVirtualActiveSet>, {0x417A}, "VirtualActiveSet"},
                simInfo(held<&Index::objSimInfo>),
                {"HSDPA Info", held<&Index::objHSDPAInformation>, {0x4221}},
            },
        .noSection = "HSDPAInformation",
        .consoleAtEnd = "Deallocing Ostrel_GSMClassIndex\nDeallocing ClassIndex\n",
        .lists = {"Equivalent PLMN List", "Neighboring Cells", "Active Set", "Detected Set", "Monitored Set",
                  "Virtual Active Set", "GSM Set", "UMTS Set", "PDP Context Info"},
        .silent = {"Coding Scheme", "UMTS RR Measurement", "Cell Change Counters", "Non-Ranked GSM Set",
                   "Non-Ranked UMTS Set", "HSDPA Info"},
        .groups = {"Registration", "GSM", "UMTS", "Reselection", "Packet Data"},
        .longestShort = 13,
        .shortLines = {},
        .full = recordWith(0, 300, {{13, 1}, {14, 1}, {15, 1}, {16, 1}, {17, 1}, {28, 1}}),
        .cells = cellInfo({cell("GSM", "Serving", {{"ARFCN", 1}}), cell("UMTS", "Serving"),
                           cell("GSM", "Neighbor"), cell("UMTS", "Neighbor")}),
        .fullLines = {{0xFF0001, testing::Gt(1u)}}, // what the cells lack
        .decoder =
            {
                .another = anotherLike<Ostrel_GSMLogGenerator>,
                .firstLine = {LogPriority::Error, "Creating Ostrel_GSMLogGenerator object"},
                // The base class, which is at the same address, logs the same once more.
                .destruction = {"Ostrel_GSMLogGenerator", "Ostrel_GSMLogGenerator"},
                .record = record(0x4125, "04"),
                .group = "UMTS",
                .section = "UMTS RR Info",
                .node = "{RRC State 'CELL_PCH'}",
            },
    };
}

} // namespace velmora
