// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Cells/ModemServingCell.h"

#include "LogGenerator/Modem/Cells/CellTable.h"
#include "LogGenerator/Modem/ModemStatus.h"
#include "LogGenerator/Observations/ContentVisitor.h"
#include "LogMessages/LiveModem.h"

#include <algorithm>

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View cellViews[] = {{LiveModemCode::cells, std::size_t{0}}};
constexpr std::size_t mostServingCells = 2; // of 5G non-standalone

} // namespace

std::span<const View> ModemServingCell::views() const {
    return cellViews;
}

std::string ModemServingCell::stateOf(const Dictionary& message) const {
    if (const auto trouble = cellTrouble(message))
        return *trouble;
    const std::string state = workingState(message);
    return cellsOf(message).serving.empty() ? state + ", no serving cell" : state;
}

void ModemServingCell::checkMessage(const Dictionary& message) const {
    const ReportedCells cells = cellsOf(message);
    reportMissingEntries(std::min(cells.serving.size(), mostServingCells) + cells.neighbors.size(),
                         cells.count, LiveModemCode::cells);
}

void ModemServingCell::show(const Dictionary& message, FieldVisitor& visitor) const {
    const ReportedCells cells = cellsOf(message);
    if (!cells.serving.empty())
        visitCell(cells.serving[0], servingCellRows(), visitor);
}

void ModemServingCell::describeShown(ContentVisitor& visitor) const {
    for (const CellRow& row : servingCellRows())
        visitor.field(row.field);
}

} // namespace velmora
