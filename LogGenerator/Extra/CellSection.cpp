// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/CellSection.h"

#include "LogGenerator/Observations/ContentVisitor.h"
#include "Platform/SystemLog.h"

#include <algorithm>

namespace velmora {

namespace {

bool isOneOf(const CellKind& kind, std::span<const CellKind> kinds) {
    return std::find(kinds.begin(), kinds.end(), kind) != kinds.end();
}

} // namespace

void CellSection::updateWithData(const Data& data, std::uint32_t logCode) {
    if (logCode != cellInformation.code) {
        Base::updateWithData(data, logCode);
        return;
    }
    trace();
    updateCells(data);
}

void CellSection::updateCells(const Data& data) {
    const bool isList = cellTable().shown == CellTable::Shown::Rows;
    _selected.clear();
    if (const std::vector<Cell>* const cells = _cells->read(data)) {
        select(*cells);
    } else {
        observeDamage(Damage::Unreadable);
        noCells();
    }
    if (_selected.empty() && !isList)
        return; // what is shown of an earlier cell stays
    const View* const view = viewOf(cellInformation.code);
    keep(*view, Record(Bytes()), isList ? 1 : partsOfSelected(), [this] { std::swap(_selected, _shown); });
}

void CellSection::select(const std::vector<Cell>& cells) {
    const CellTable& table = cellTable();
    for (const Cell& cell : cells) {
        if (!isOneOf(cell.kind, table.kinds))
            continue;
        logMissingFields(cell, table.fields);
        _selected.push_back(cell);
        if (table.shown == CellTable::Shown::First)
            return;
    }
}

KeptRecords::Parts CellSection::partsOfSelected() const {
    KeptRecords::Parts parts = 0;
    for (const Cell& cell : _selected)
        parts |= fieldsOf(cell, cellTable().fields);
    return parts;
}

void CellSection::noCells() const {
    logLine(LogPriority::Error, "Failed to get Cell Array\n");
}

void CellSection::decode(const View& view, const Record& record, FieldVisitor& visitor) const {
    if (view.code != cellInformation.code) {
        Base::decode(view, record, visitor);
        return;
    }
    const CellTable& table = cellTable();
    if (table.shown != CellTable::Shown::Rows) {
        for (const Cell& cell : _shown)
            visitCell(cell, table.fields, visitor);
        return;
    }
    visitor.beginList(table.list);
    for (const Cell& cell : _shown) {
        visitor.beginRow();
        visitCell(cell, table.fields, visitor);
        visitor.endRow();
    }
    visitor.endList();
}

void CellSection::describe(const View& view, ContentVisitor& visitor) const {
    if (view.code != cellInformation.code) {
        Base::describe(view, visitor);
        return;
    }
    const CellTable& table = cellTable();
    const bool isList = table.shown == CellTable::Shown::Rows;
    if (isList)
        visitor.beginList(table.list);
    for (const CellField& row : table.fields)
        visitor.keyed(row.field,
                      {.key = cellNumberKeys[row.key.index],
                       .lowBits = row.number == CellNumber::Whole ? std::uint8_t{0} : std::uint8_t{16},
                       .isSigned = row.number == CellNumber::SignedLow16});
    if (isList)
        visitor.endList();
}

} // namespace velmora
