// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/NeighbourColumns.h"

#include "Analysis/Rules/Evaluation/NumberOperations.h"

#include <algorithm>

namespace velmora {

namespace {

double numberOf(const std::optional<double>& value) {
    return value ? finiteNumber(*value) : unknownNumber;
}

} // namespace

void NeighbourColumns::set(std::span<const Neighbour> neighbours) {
    _size = neighbours.size();
    for (std::vector<double>& each : _columns)
        each.resize(_size);
    auto& [channels, physicalCells, levels, qualities, detected] = _columns;
    for (std::size_t i = 0; i < _size; ++i) {
        const Neighbour& each = neighbours[i];
        channels[i] = numberOf(each.channel);
        physicalCells[i] = numberOf(each.physicalCell);
        levels[i] = numberOf(each.level_dBm);
        qualities[i] = numberOf(each.quality_dB);
        detected[i] = truthNumber(each.isDetected);
    }
}

double NeighbourColumns::valueOf(const Neighbour& neighbour, Role role) {
    switch (role) {
    case Role::NeighbourChannel: return numberOf(neighbour.channel);
    case Role::NeighbourPhysicalCell: return numberOf(neighbour.physicalCell);
    case Role::NeighbourLevel: return numberOf(neighbour.level_dBm);
    case Role::NeighbourQuality: return numberOf(neighbour.quality_dB);
    default: return truthNumber(neighbour.isDetected);
    }
}

std::size_t NeighbourColumns::indexOf(Role role) {
    const auto found = std::find(roles.begin(), roles.end() - 1, role);
    return static_cast<std::size_t>(found - roles.begin());
}

} // namespace velmora
