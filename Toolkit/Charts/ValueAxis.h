// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Charts/Sample.h"

#include <cstddef>
#include <optional>
#include <vector>

namespace velmora {

/// An axis of values that begins, ends and has its marks at round numbers.
struct ValueAxis {
    double minimum = 0;
    double maximum = 1;
    std::vector<double> marks;
    int decimals = 0; ///< that the marks need

    /// For values within `extremes`, with at most `markLimit` marks (at least 2); given ends are kept as they
    /// are.
    [[nodiscard]] static ValueAxis covering(const Extremes& extremes, std::optional<double> minimum,
                                            std::optional<double> maximum, std::size_t markLimit);
};

} // namespace velmora
