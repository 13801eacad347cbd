// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <vector>

namespace velmora {

/// The serving cell's entry in this list of measurements; the cell at the receiver's sensitivity where it is
/// not in the list.
template <class Measurement>
[[nodiscard]] Measurement updatedMeasurement(const Measurement& serving,
                                             const std::vector<Measurement>& list) {
    const auto found = std::find_if(list.begin(), list.end(),
                                    [&](const Measurement& each) { return each.cell == serving.cell; });
    if (found != list.end())
        return *found;
    Measurement lost;
    lost.cell = serving.cell;
    return lost;
}

} // namespace velmora
