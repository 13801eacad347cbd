// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/ServingCells.h"

#include "Analysis/Picture/RadioPicture.h"

namespace velmora {

namespace {

bool areEqual(const CellIdentity& a, const CellIdentity& b) {
    return a.technology == b.technology && a.cell == b.cell && a.channel == b.channel &&
           a.physicalCell == b.physicalCell;
}

void learn(CellIdentity& known, const CellIdentity& cell) {
    const auto add = [](auto& one, const auto& other) {
        if (!one)
            one = other;
    };
    add(known.technology, cell.technology);
    add(known.cell, cell.cell);
    add(known.channel, cell.channel);
    add(known.physicalCell, cell.physicalCell);
}

} // namespace

std::uint32_t ServingCells::numberOf(const RadioPicture& picture) {
    if (areEqual(picture.servingCell(), _latest) && !picture.servingChange())
        return _number;
    const CellIdentity cell = picture.serving();
    _latest = cell;
    if (!cell.isKnown())
        return _number = unknown;
    // Without a change of the cell it is the same one, of which more or less is known now.
    const bool isSame = _number != unknown && _number != further && !picture.servingChange() &&
                        areSameCell(_cells[_number - 1], cell) != false;
    if (!isSame)
        _number = find(cell);
    if (_number != further)
        learn(_cells[_number - 1], cell);
    return _number;
}

std::uint32_t ServingCells::find(const CellIdentity& cell) {
    for (std::size_t i = 0; i < _cells.size(); ++i)
        if (areSameCell(_cells[i], cell) == true)
            return static_cast<std::uint32_t>(i + 1);
    if (_cells.size() == mostCells)
        return further;
    _cells.push_back(cell);
    return static_cast<std::uint32_t>(_cells.size());
}

} // namespace velmora
