// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Comparison/DisplayComparison.h"
#include "Tools/Diff/DiffSide.h"

#include <string>
#include <vector>

namespace velmora {

/// The differences between what two inputs show of a technology.
struct TechnologyDifferences {
    std::string technology; ///< the short name
    bool isInA = false;     ///< whether the input has messages of it
    bool isInB = false;
    std::vector<DisplayDifference> differences;
};

/// Those of each technology, in the order of A and then of B, as far as they are chosen.
[[nodiscard]] std::vector<TechnologyDifferences> displayDifferences(const DiffSide& a, const DiffSide& b,
                                                                    const LeafChoice& choice);

/// A comparison's texts, complete lines.
[[nodiscard]] std::string displayDiffText(const std::vector<TechnologyDifferences>& technologies);
[[nodiscard]] std::string displayDiffJson(const DiffSide& a, const DiffSide& b,
                                          const std::vector<TechnologyDifferences>& technologies);
[[nodiscard]] std::string statisticsDiffText(const DiffSide& a, const DiffSide& b);
[[nodiscard]] std::string statisticsDiffJson(const DiffSide& a, const DiffSide& b);

} // namespace velmora
