// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/PathPattern.h"
#include "Tools/Decode/Paths/NodeSelection.h"

#include <cstddef>
#include <span>
#include <string>
#include <vector>

namespace velmora {

/// Which leaves of a catalogue a selection selects, and under which names. Leaves that messages add to the
/// catalogue are looked up when they are first seen.
class SelectedLeaves {
public:
    struct Choice {
        std::size_t path; ///< of the selection: its index
        PathPattern::Rows rows;
    };

    explicit SelectedLeaves(const NodeSelection& selection);

    /// How the leaf is selected; empty where it is not. Without a selection every leaf is, by path 0.
    [[nodiscard]] std::span<const Choice> of(const CatalogueField& leaf);
    /// The first choice that selects the observation; null for none.
    [[nodiscard]] const Choice* of(const Observation& observation);
    [[nodiscard]] const std::vector<PathPattern>& patterns() const { return _patterns; }

private:
    std::vector<PathPattern> _patterns;
    std::vector<std::vector<Choice>> _choices; ///< by the leaf's index in its catalogue
};

} // namespace velmora
