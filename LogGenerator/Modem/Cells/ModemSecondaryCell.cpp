// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/Cells/ModemSecondaryCell.h"

#include "LogGenerator/Modem/Cells/CellTable.h"
#include "LogGenerator/Modem/ModemStatus.h"
#include "LogGenerator/Observations/ContentVisitor.h"
#include "LogMessages/LiveModem.h"

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View cellViews[] = {{LiveModemCode::cells, std::size_t{0}}};

} // namespace

std::span<const View> ModemSecondaryCell::views() const {
    return cellViews;
}

std::string ModemSecondaryCell::stateOf(const Dictionary& message) const {
    if (const auto trouble = cellTrouble(message))
        return *trouble;
    return cellsOf(message).serving.size() < 2 ? "None" : workingState(message);
}

void ModemSecondaryCell::show(const Dictionary& message, FieldVisitor& visitor) const {
    const ReportedCells cells = cellsOf(message);
    if (cells.serving.size() >= 2)
        visitCell(cells.serving[1], secondaryCellRows(), visitor);
}

void ModemSecondaryCell::describeShown(ContentVisitor& visitor) const {
    for (const CellRow& row : secondaryCellRows())
        visitor.field(row.field);
}

} // namespace velmora
