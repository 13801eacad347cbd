// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/InputStore.h"

#include <algorithm>
#include <optional>

namespace velmora {

std::uint32_t InputStore::add(const RuleInput& input) {
    const auto found = std::find_if(_slots.begin(), _slots.end(),
                                    [&input](const Slot& each) { return each.input == input; });
    if (found != _slots.end())
        return static_cast<std::uint32_t>(found - _slots.begin());
    _slots.push_back({input, {}, 0});
    return static_cast<std::uint32_t>(_slots.size() - 1);
}

void InputStore::beginTurn(MessageNumber message, Time now) {
    ++_turn;
    _message = message;
    _now = now;
    _touched.clear();
}

void InputStore::touch(std::uint32_t slot) {
    ++_slots[slot].changes;
    if (_slots[slot].turn == _turn)
        return;
    _slots[slot].turn = _turn;
    _touched.push_back(slot);
}

void InputStore::set(std::uint32_t slot, const ReportedValue& value, std::span<const std::uint32_t> rows) {
    std::vector<InputCell>& cells = _slots[slot].cells;
    auto cell = std::find_if(cells.begin(), cells.end(), [rows](const InputCell& each) {
        return std::equal(each.rows.begin(), each.rows.end(), rows.begin(), rows.end());
    });
    if (cell == cells.end()) {
        if (cells.size() == mostRows)
            return;
        cell = cells.emplace(cells.end());
        cell->rows.assign(rows.begin(), rows.end());
    }
    touch(slot);
    const bool isKnown = value.kind != ObservedKind::Absent;
    // A value that comes back after it was absent is compared with the one before.
    const bool isOther =
        isKnown && cell->turn != 0 && (cell->number != value.number || cell->text != value.text);
    cell->hasChanged = (cell->turn == _turn && cell->hasChanged) || isOther;
    cell->kind = value.kind;
    if (!isKnown)
        return;
    cell->number = value.number;
    cell->text.assign(value.text);
    cell->time = _now;
    cell->turn = _turn;
    cell->message = _message;
}

void InputStore::remove(std::uint32_t slot) {
    if (_slots[slot].cells.empty())
        return;
    touch(slot);
    if (_slots[slot].input.isEach())
        _slots[slot].cells.clear();
    for (InputCell& cell : _slots[slot].cells)
        cell.kind = ObservedKind::Absent;
}

bool InputStore::isReported(std::uint32_t slot) const {
    if (!isTouched(slot))
        return false;
    const Slot& values = _slots[slot];
    if (values.input.isNeighbour()) // touched where one has become too old, too
        return std::any_of(_neighbours.begin(), _neighbours.end(),
                           [this](const Neighbour& each) { return each.time == _now; });
    return std::any_of(values.cells.begin(), values.cells.end(),
                       [this](const InputCell& each) { return each.isKnown() && each.turn == _turn; });
}

void InputStore::setNeighbours(std::span<const Neighbour> neighbours) {
    _neighbours.assign(neighbours.begin(), neighbours.end());
    _neighbourColumns.set(neighbours);
    for (std::uint32_t i = 0; i < _slots.size(); ++i) {
        const RuleInput& input = _slots[i].input;
        if (input.kind == RuleInput::Kind::EachNeighbour)
            touch(i);
        else if (input.kind == RuleInput::Kind::StrongestNeighbour)
            set(i, neighbours.empty() ? ReportedValue() : valueOf(neighbours.front(), input.role));
    }
}

void InputStore::clear() {
    for (Slot& slot : _slots) {
        slot.cells.clear();
        ++slot.changes;
    }
    _neighbours.clear();
    _neighbourColumns.clear();
    _touched.clear();
}

ReportedValue valueOf(const Neighbour& neighbour, Role role) {
    const auto number = [](const std::optional<double>& value) {
        return value ? ReportedValue{ObservedKind::Number, *value} : ReportedValue();
    };
    switch (role) {
    case Role::NeighbourChannel: return number(neighbour.channel);
    case Role::NeighbourPhysicalCell: return number(neighbour.physicalCell);
    case Role::NeighbourLevel: return number(neighbour.level_dBm);
    case Role::NeighbourQuality: return number(neighbour.quality_dB);
    default: return {ObservedKind::Flag, neighbour.isDetected ? 1.0 : 0.0};
    }
}

} // namespace velmora
