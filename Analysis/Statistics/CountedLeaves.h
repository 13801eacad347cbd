// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/GroupStatistics.h"
#include "Analysis/Statistics/LeafChoice.h"

#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// How the observations of a leaf are counted.
struct CountedLeaf {
    bool isKnown = false;
    bool isChosen = false;
    bool isIdentifying = false;           ///< its texts are of an identity
    LeafStatistics* statistics = nullptr; ///< in the current part, once they have been looked up
    std::string name;                     ///< as the choice names it
    std::vector<PathPattern::Rows> rows;  ///< in any of which they must be; empty for all
    std::optional<WorstMinute::Measure> measure;

    /// Whether the observation is chosen and can be counted: bytes cannot, and neither can texts that
    /// identify someone or something.
    [[nodiscard]] bool counts(const Observation& observation) const {
        if (!isChosen || observation.kind == ObservedKind::Binary ||
            (isIdentifying && observation.kind == ObservedKind::Text))
            return false;
        return rows.empty() || isInRows(observation);
    }

private:
    [[nodiscard]] bool isInRows(const Observation& observation) const;
};

/// How the leaves of a technology are counted, by a choice that is looked at once a leaf.
class CountedLeaves {
public:
    /// The choice must outlive it.
    explicit CountedLeaves(const LeafChoice& choice) : _choice(choice) {}

    /// Valid until the next call.
    [[nodiscard]] CountedLeaf& of(const CatalogueField& leaf) {
        return leaf.index < _leaves.size() && _leaves[leaf.index].isKnown ? _leaves[leaf.index] : make(leaf);
    }
    /// Another part is the current one.
    void forgetStatistics() {
        for (CountedLeaf& use : _leaves)
            use.statistics = nullptr;
    }

private:
    [[nodiscard]] CountedLeaf& make(const CatalogueField& leaf);

    const LeafChoice& _choice;
    std::vector<CountedLeaf> _leaves; ///< by the leaf's index in the catalogue
};

} // namespace velmora
