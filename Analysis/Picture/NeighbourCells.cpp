// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Picture/NeighbourCells.h"

#include "Analysis/Picture/PhysicalCell.h"

#include <algorithm>
#include <bit>
#include <limits>
#include <utility>

namespace velmora {

namespace {

constexpr double noLevel = -std::numeric_limits<double>::infinity();

/// Whether it can be compared with others.
bool hasIdentity(const Neighbour& cell) {
    return cell.channel && cell.physicalCell;
}

/// Precondition: both have an identity.
bool areSame(const Neighbour& one, const Neighbour& other) {
    return *one.channel == *other.channel && *one.physicalCell == *other.physicalCell &&
           one.technology == other.technology;
}

std::size_t hashOf(const Neighbour& cell) {
    // Of a whole number as small as these, the upper half holds all digits. Adding 0 makes 0 of -0.
    const std::uint64_t channel = std::bit_cast<std::uint64_t>(*cell.channel + 0.0) >> 32;
    const std::uint64_t physicalCell = std::bit_cast<std::uint64_t>(*cell.physicalCell + 0.0) >> 32;
    return static_cast<std::size_t>((channel * 0x9E3779B97F4A7C15 + physicalCell * 0xC2B2AE3D27D4EB4F) >> 32);
}

} // namespace

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
        NewCell& cell = _new.emplace_back();
        cell.list = use.list;
        cell.neighbour.time = report.time;
        cell.neighbour.message = report.message;
        cell.neighbour.isDetected = use.isOfDetectedCell;
        if (use.side != commonSide)
            cell.neighbour.technology = static_cast<RadioTechnology>(use.side);
    }
    NewCell& cell = _new.back();
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

void NeighbourCells::setAll(std::vector<Neighbour> cells, std::vector<const CatalogueNode*> lists) {
    _cells = std::move(cells);
    _lists = std::move(lists);
    _oldest = Time::max();
    for (const Neighbour& each : _cells)
        _oldest = std::min(_oldest, each.time);
}

bool NeighbourCells::isReplaced(const Neighbour& cell, const CatalogueNode* list, Time now) const {
    if (now - cell.time > lifetime)
        return true;
    const bool isOnChannel = _channel && cell.channel == _channel;
    if (std::find(_replaced.begin(), _replaced.end(), list) == _replaced.end())
        return isOnChannel && !_replaced.empty(); // by the report of the phone's other mode
    return !_channel || !cell.channel || isOnChannel;
}

std::uint32_t& NeighbourCells::slotOf(const Neighbour& cell) {
    const std::size_t mask = _seen.size() - 1;
    std::size_t slot = hashOf(cell) & mask;
    while (_seen[slot] != 0 && !areSame(at(_seen[slot] - 1), cell))
        slot = (slot + 1) & mask;
    return _seen[slot];
}

bool NeighbourCells::mayReplace() const {
    return !_replaced.empty() &&
           (_channel || std::any_of(_lists.begin(), _lists.end(), [this](const auto* list) {
                return std::find(_replaced.begin(), _replaced.end(), list) != _replaced.end();
            }));
}

/// One that the message has twice is one neighbour: the later one.
void NeighbourCells::rankNew() {
    _newRanks.clear();
    _seen.assign(std::bit_ceil(2 * _new.size() + 1), 0);
    const auto kept = static_cast<std::uint32_t>(_cells.size());
    for (auto order = static_cast<std::uint32_t>(kept + _new.size()); order-- > kept;) {
        const NewCell& cell = _new[order - kept];
        if (cell.isServing)
            continue;
        if (hasIdentity(cell.neighbour)) {
            std::uint32_t& slot = slotOf(cell.neighbour);
            if (slot != 0)
                continue;
            slot = order + 1;
        }
        _newRanks.push_back({cell.neighbour.level_dBm.value_or(noLevel), order});
    }
    std::sort(_newRanks.begin(), _newRanks.end());
}

/// The kept cells are in their order already. One that the message has too is that of the message.
void NeighbourCells::rank(Time now) {
    rankNew();
    _ranks.clear();
    auto next = _newRanks.begin();
    for (std::uint32_t order = 0; order < _cells.size(); ++order) {
        const Neighbour& cell = _cells[order];
        if (isReplaced(cell, _lists[order], now) || (hasIdentity(cell) && slotOf(cell) != 0))
            continue;
        const Rank rank{cell.level_dBm.value_or(noLevel), order};
        for (; next != _newRanks.end() && *next < rank; ++next)
            _ranks.push_back(*next);
        _ranks.push_back(rank);
    }
    _ranks.insert(_ranks.end(), next, _newRanks.end());
    if (_ranks.size() > most)
        _ranks.resize(most);
}

void NeighbourCells::arrange() {
    _nextCells.clear();
    _nextLists.clear();
    _oldest = Time::max();
    for (const Rank& each : _ranks) {
        _nextCells.push_back(at(each.order));
        _nextLists.push_back(listOf(each.order));
        _oldest = std::min(_oldest, _nextCells.back().time);
    }
    _cells.swap(_nextCells);
    _lists.swap(_nextLists);
}

bool NeighbourCells::endMessage(Time now) {
    const bool hasOld = !_cells.empty() && now - _oldest > lifetime;
    if (_replaced.empty() && _new.empty() && !hasOld)
        return false;
    for (NewCell& cell : _new)
        if (!cell.neighbour.channel)
            cell.neighbour.channel = _channel;
    if (!_new.empty() || hasOld || mayReplace()) {
        rank(now);
        arrange();
    }
    _replaced.clear();
    return true;
}

} // namespace velmora
