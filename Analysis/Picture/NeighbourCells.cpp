// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/NeighbourCells.h"

#include "Analysis/Picture/PhysicalCell.h"

#include <algorithm>
#include <tuple>

namespace velmora {

void NeighbourCells::add(const Observation& observation, const LeafUse& use, const MessageReport& report,
                         const TechnologyTable& table) {
    if (observation.kind == ObservedKind::Absent)
        return;
    const double number =
        observation.kind == ObservedKind::Number ? observation.number : static_cast<double>(observation.raw);
    if (use.part == NeighbourPart::Channel) {
        _channel = number;
        return;
    }
    if (!use.list || observation.rows.empty())
        return;
    if (_new.empty() || _row.list != use.list || _row.number != observation.rows.back()) {
        _row = {use.list, observation.rows.back()};
        Cell& cell = _new.emplace_back();
        cell.list = use.list;
        cell.neighbour.time = report.time;
        cell.neighbour.message = report.message;
        cell.neighbour.isDetected = use.isOfDetectedCell;
        if (use.side != commonSide)
            cell.neighbour.technology = static_cast<RadioTechnology>(use.side);
    }
    Cell& cell = _new.back();
    switch (use.role) {
    case Role::NeighbourChannel: cell.neighbour.channel = number; break;
    case Role::NeighbourPhysicalCell: cell.neighbour.physicalCell = physicalCellOf(observation); break;
    case Role::NeighbourLevel: cell.neighbour.level_dBm = number; break;
    case Role::NeighbourQuality: cell.neighbour.quality_dB = number; break;
    default: break;
    }
    if (use.part == NeighbourPart::Set) {
        cell.isServing = observation.raw == table.activeSet;
        cell.neighbour.isDetected = observation.raw == table.detectedSet;
    } else if (use.part == NeighbourPart::Technology) {
        cell.neighbour.technology = technologyOf(observation.raw, table);
    }
}

void NeighbourCells::removeReplaced(Time now) {
    const auto isGone = [this, now](const Cell& cell) {
        if (now - cell.neighbour.time > lifetime)
            return true;
        const bool isOnChannel = _channel && cell.neighbour.channel == _channel;
        if (std::find(_replaced.begin(), _replaced.end(), cell.list) == _replaced.end())
            return isOnChannel && !_replaced.empty(); // by the report of the phone's other mode
        return !_channel || !cell.neighbour.channel || isOnChannel;
    };
    std::erase_if(_kept, isGone);
}

/// A cell that several lists have, or one list has twice, is one neighbour: that of the latest report.
void NeighbourCells::removeRepeated() {
    const auto identity = [](const Cell& cell) {
        return std::tie(cell.neighbour.technology, cell.neighbour.channel, cell.neighbour.physicalCell);
    };
    // Not std::stable_sort, which allocates.
    for (std::size_t i = 0; i < _kept.size(); ++i)
        _kept[i].order = i;
    std::sort(_kept.begin(), _kept.end(), [&](const Cell& one, const Cell& other) {
        return std::tuple_cat(identity(one), std::tie(other.order)) <
               std::tuple_cat(identity(other), std::tie(one.order));
    });
    const auto isRepeated = [&](const Cell& one, const Cell& other) {
        return one.neighbour.channel && one.neighbour.physicalCell && identity(one) == identity(other);
    };
    _kept.erase(std::unique(_kept.begin(), _kept.end(), isRepeated), _kept.end());
}

bool NeighbourCells::endMessage(Time now) {
    if (_replaced.empty() && _new.empty()) {
        const auto isOld = [now](const Neighbour& cell) { return now - cell.time > lifetime; };
        if (std::none_of(_cells.begin(), _cells.end(), isOld))
            return false;
    }
    removeReplaced(now);
    _replaced.clear();
    for (Cell& cell : _new) {
        if (cell.isServing)
            continue;
        if (!cell.neighbour.channel)
            cell.neighbour.channel = _channel;
        _kept.push_back(cell);
    }
    removeRepeated();
    std::sort(_kept.begin(), _kept.end(), [](const Cell& one, const Cell& other) {
        return std::tie(one.neighbour.level_dBm, other.order) >
               std::tie(other.neighbour.level_dBm, one.order);
    });
    if (_kept.size() > most)
        _kept.resize(most);
    _cells.clear();
    for (const Cell& cell : _kept)
        _cells.push_back(cell.neighbour);
    return true;
}

} // namespace velmora
