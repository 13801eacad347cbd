// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/NeighbourColumns.h"

#include "Analysis/Rules/Evaluation/NumberOperations.h"

#include <algorithm>

namespace velmora {

void NeighbourColumns::set(std::span<const Neighbour> neighbours) {
    _size = neighbours.size();
    for (std::size_t i = 0; i < roles.size(); ++i) {
        _columns[i].resize(_size);
        std::transform(neighbours.begin(), neighbours.end(), _columns[i].begin(),
                       [role = roles[i]](const Neighbour& each) { return valueOf(each, role); });
    }
}

double NeighbourColumns::valueOf(const Neighbour& neighbour, Role role) {
    const auto number = [](const std::optional<double>& value) {
        return finiteNumber(value.value_or(unknownNumber));
    };
    switch (role) {
    case Role::NeighbourChannel: return number(neighbour.channel);
    case Role::NeighbourPhysicalCell: return number(neighbour.physicalCell);
    case Role::NeighbourLevel: return number(neighbour.level_dBm);
    case Role::NeighbourQuality: return number(neighbour.quality_dB);
    default: return truthNumber(neighbour.isDetected);
    }
}

std::size_t NeighbourColumns::indexOf(Role role) {
    const auto found = std::find(roles.begin(), roles.end() - 1, role);
    return static_cast<std::size_t>(found - roles.begin());
}

} // namespace velmora
