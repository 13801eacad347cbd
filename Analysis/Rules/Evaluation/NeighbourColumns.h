// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/Reading.h"
#include "LogGenerator/Fields/Role.h"

#include <array>
#include <cstddef>
#include <span>
#include <vector>

namespace velmora {

/// The values of all neighbours, a column a role: rules go through one column after the other.
class NeighbourColumns {
public:
    void set(std::span<const Neighbour> neighbours);
    void clear() { set({}); }

    [[nodiscard]] std::size_t size() const { return _size; }
    /// In the order of the neighbours; NaN where one has no value. For `None` 1 where it was detected, or 0.
    [[nodiscard]] std::span<const double> of(Role role) const { return _columns[indexOf(role)]; }

    /// The value of one neighbour in its column.
    [[nodiscard]] static double valueOf(const Neighbour& neighbour, Role role);

private:
    static constexpr std::array<Role, 5> roles{Role::NeighbourChannel, Role::NeighbourPhysicalCell,
                                               Role::NeighbourLevel, Role::NeighbourQuality, Role::None};
    [[nodiscard]] static std::size_t indexOf(Role role);

    std::size_t _size = 0;
    std::array<std::vector<double>, roles.size()> _columns;
};

} // namespace velmora
