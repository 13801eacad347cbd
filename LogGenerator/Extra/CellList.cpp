// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/CellList.h"

#include "LogGenerator/Extra/BinaryCellReader.h"
#include "LogGenerator/Extra/CellInfoArray.h"
#include "LogMessages/LogMessage.h"

#include <algorithm>

namespace velmora {

namespace {

/// A longer payload is read again by every section, and so not cached.
constexpr std::size_t longestKept = std::size_t{1} << 16;

/// A cell of the array as the property-list reader returned it.
Cell cellOf(const Dictionary& fields) {
    Cell cell;
    if (const std::string* text = fields[kVoxCellMonitorCellRadioAccessTechnology].asString())
        cell.kind.technology = indexOf(*text, cellTechnologies);
    if (const std::string* text = fields[kVoxCellMonitorCellType].asString())
        cell.kind.type = indexOf(*text, cellTypes);
    for (std::size_t i = 0; i < cellNumberCount; ++i)
        if (const auto number = cellNumber(fields, cellNumberKeys[i]))
            cell.setNumber(i, *number);
    return cell;
}

} // namespace

const std::vector<Cell>* CellList::read(const Data& record) {
    if (_isRead)
        return &_cells;
    if (!readPayload(record))
        return nullptr;
    _isRead = _isSameRecord;
    return &_cells;
}

bool CellList::readPayload(const Data& record) {
    const Bytes payload = record.from(LogMessage::headerLength).bytes();
    if (!_payload.empty() && std::equal(payload.begin(), payload.end(), _payload.begin(), _payload.end()))
        return true;
    _payload.clear();
    _cells.clear();
    bool good = readBinaryCells(payload, _cells);
    if (!good) {
        _cells.clear();
        good = _xmlReader.read({reinterpret_cast<const char*>(payload.data()), payload.size()}, _cells);
    }
    if (!good) {
        _cells.clear();
        if (!readAsPropertyList(record))
            return false;
    }
    if (payload.size() <= longestKept)
        _payload.assign(payload.begin(), payload.end());
    return true;
}

bool CellList::readAsPropertyList(const Data& record) {
    const CellInfoArrayReader reader(record);
    const Array* cells = reader.parsed().asArray();
    if (!cells)
        return false;
    for (const Value& cell : *cells)
        if (const Dictionary* fields = cell.asDictionary())
            _cells.push_back(cellOf(*fields));
    return true;
}

const Cell* firstCell(const std::vector<Cell>& cells, const CellKind& kind) {
    const auto found =
        std::find_if(cells.begin(), cells.end(), [&kind](const Cell& cell) { return cell.kind == kind; });
    return found == cells.end() ? nullptr : &*found;
}

} // namespace velmora
