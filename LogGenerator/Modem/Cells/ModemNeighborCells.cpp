// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Cells/ModemNeighborCells.h"

#include "LogGenerator/Modem/Cells/CellTable.h"
#include "LogGenerator/Modem/ModemStatus.h"
#include "LogGenerator/Modem/Values/ValueRow.h"
#include "LogMessages/LiveModem.h"

#include <algorithm>

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View cellViews[] = {{LiveModemCode::cells, std::size_t{0}}};

constexpr ValueRow leftOut{
    kVoxModemCellsLeftOut, {"Cells Left Out", computed, integer("%d")}, {1, 0x7FFFFFFE}};
constexpr std::string_view rowKeys[] = {
    "Radio Technology",  "ARFCN", "UARFCN",   "EARFCN", "NR-ARFCN", "BSIC", "PSC",
    "Cell Parameter ID", "PCI",   "PN Offset"};
constexpr List cellList{.label = "Cells", .keys = rowKeys};

/// The neighbours by falling level; those without one keep their order at the end.
std::vector<ReportedCell> byLevel(std::vector<ReportedCell> cells) {
    static constexpr double none = -1000; // dBm
    std::stable_sort(cells.begin(), cells.end(), [](const ReportedCell& a, const ReportedCell& b) {
        return a.level().value_or(none) > b.level().value_or(none);
    });
    return cells;
}

} // namespace

std::span<const View> ModemNeighborCells::views() const {
    return cellViews;
}

std::string ModemNeighborCells::stateOf(const Dictionary& message) const {
    if (const auto trouble = cellTrouble(message))
        return *trouble;
    if (const auto trouble = neighborTrouble(message))
        return *trouble;
    const std::size_t count = cellsOf(message).neighbors.size();
    if (count == 0)
        return "None";
    return std::to_string(count) + (count == 1 ? " cell" : " cells");
}

void ModemNeighborCells::show(const Dictionary& message, FieldVisitor& visitor) const {
    visitValue(message[leftOut.key], leftOut, visitor);
    visitor.beginList(cellList);
    for (const ReportedCell& cell : byLevel(cellsOf(message).neighbors)) {
        visitor.beginRow();
        visitCell(cell, neighborCellRows(), visitor);
        visitor.endRow();
    }
    visitor.endList();
}

void ModemNeighborCells::describeShown(ContentVisitor& visitor) const {
    visitor.field(leftOut.field);
    visitor.beginList(cellList);
    for (const CellRow& row : neighborCellRows())
        visitor.field(row.field);
    visitor.endList();
}

} // namespace velmora
