// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/ValueCounts.h"

#include <cstdint>
#include <optional>

namespace velmora {

/// What statistics say of numbers: absent where there are no values to say it of.
struct NumberFigures {
    NumberFigures() = default;
    explicit NumberFigures(const ValueCounts& values);

    std::uint64_t samples = 0;
    std::optional<double> minimum;
    std::optional<double>
        p5; ///< percentiles by nearest rank; absent also where they would be no more than guesses
    std::optional<double> p50;
    std::optional<double> p95;
    std::optional<double> maximum;
    std::optional<double> mean;
    /// How far the percentiles may be from the exact ones, as a part of these; 0 where they are exact.
    double relativeError = 0;
};

} // namespace velmora
