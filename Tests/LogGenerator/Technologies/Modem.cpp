// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemClassIndex.h"
#include "LogGenerator/Modem/ModemLogGenerator.h"
#include "Platform/TelephonyService.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/LogGenerator/Technologies/Technologies.h"
#include "Tests/Support/Hex.h"

namespace velmora {

Technology expectedModem() {
    using Index = ModemClassIndex;
    const testing::Matcher<std::size_t> unreadable = 2; // the trace, and that it cannot be read
    return {
        .name = "Modem",
        .constant = kVoxLogChannelTechnology_Modem,
        .templateName = "Modem",
        .makeIndex = std::make_unique<Index>,
        .sections =
            {
                {"Serving Cell", held<&Index::servingCell>, {0xFF0001}},
                {"Secondary Cell", held<&Index::secondaryCell>, {0xFF0001}},
                {"Neighbor Cells", held<&Index::neighborCells>, {0xFF0001}},
                {"Link", held<&Index::link>, {0xFF0004}},
                {"Registration", held<&Index::registration>, {0xFF0003}},
                {"Packet Data Contexts", held<&Index::contexts>, {0xFF0002}},
                {"Traffic", held<&Index::traffic>, {0xFF0005}},
                {"SIM", held<&Index::sim>, {0xFF0000}},
                {"SIM Slots", held<&Index::simSlots>, {0xFF0000}},
                {"Modem", held<&Index::equipment>, {0xFF0006}},
                {"Position", held<&Index::position>, {0xFF0007}},
            },
        .noSection = "SIM Info",
        .consoleAtEnd = "Deallocing ClassIndex\n",
        .lists = {},
        .silent = {},
        .groups = {},
        .longestShort = 13,
        // Of the sections of one code, the first reports it.
        .shortLines = {{0xFF0002, unreadable},
                       {0xFF0003, unreadable},
                       {0xFF0004, unreadable},
                       {0xFF0005, unreadable},
                       {0xFF0006, unreadable},
                       {0xFF0007, unreadable}},
        .full = extraRecord(1, makeDictionary()),
        .cells = extraRecord(1, makeDictionary()),
        .fullLines = {},
        .emptyCells = extraRecord(1, makeDictionary()),
        .emptyContexts = extraRecord(2, makeDictionary()),
        .decoder =
            {
                .another = anotherLike<ModemLogGenerator>,
                .firstLine = {LogPriority::Warning, "Array Count: 1"},
                // The line of the base class alone.
                .destruction = {"Ostrel_GSMLogGenerator"},
                .record = extraRecord(4, std::make_shared<Dictionary>(Dictionary{{"kVoxModemState", 8}})),
                .group = "",
                .section = "Link",
                .node = "{State 'Registered'}",
            },
    };
}

} // namespace velmora
