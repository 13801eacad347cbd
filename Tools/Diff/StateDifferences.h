// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Diff/StatisticsPairs.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// The values of a state in two inputs, side by side.
struct StateDifferences {
    explicit StateDifferences(const LeafPair& pair);

    struct Value {
        StateKey key{};
        std::string text{};
        bool isOthers = false; ///< all that are not kept one by one
        /// The shares of time, or in a list of samples, of 1; absent where the input has nothing of the
        /// state.
        std::optional<double> a{};
        std::optional<double> b{};

        [[nodiscard]] std::optional<double> difference() const {
            return a && b ? std::optional(*b - *a) : std::nullopt;
        }
    };
    /// In the order of A's first reports, and then those that B has alone.
    std::vector<Value> values;
    std::uint64_t transitionsOfA = 0;
    std::uint64_t transitionsOfB = 0;
};

} // namespace velmora
