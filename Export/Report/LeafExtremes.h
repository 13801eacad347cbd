// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Export/Report/MessageRange.h"

#include <cstddef>
#include <vector>

namespace velmora {

/// Which messages reported the least and the greatest number of each leaf first, and between which messages
/// it was reported, so that statistics lead back to messages.
class LeafExtremes {
public:
    struct Extremes {
        bool isKnown = false;
        double minimum = 0;
        double maximum = 0;
        MessageNumber minimumAt;
        MessageNumber maximumAt;
    };

    void add(const Observation& observation, MessageNumber message) {
        const std::size_t index = observation.leaf->index;
        if (index >= _extremes.size())
            _extremes.resize(index + 1);
        Extremes& known = _extremes[index];
        if (!known.isKnown || observation.number < known.minimum) {
            known.minimum = observation.number;
            known.minimumAt = message;
        }
        if (!known.isKnown || observation.number > known.maximum) {
            known.maximum = observation.number;
            known.maximumAt = message;
        }
        known.isKnown = true;
    }

    /// Of a value of any kind.
    void addMessage(const Observation& observation, MessageNumber message) {
        const std::size_t index = observation.leaf->index;
        if (index >= _ranges.size())
            _ranges.resize(index + 1);
        _ranges[index].add(message);
    }
    /// Unknown where the leaf reported no value.
    [[nodiscard]] MessageRange range(const CatalogueField& leaf) const {
        return leaf.index < _ranges.size() ? _ranges[leaf.index] : MessageRange();
    }

    /// Null where the leaf reported no number.
    [[nodiscard]] const Extremes* find(const CatalogueField& leaf) const {
        return leaf.index < _extremes.size() && _extremes[leaf.index].isKnown ? &_extremes[leaf.index]
                                                                              : nullptr;
    }

private:
    std::vector<MessageRange> _ranges;
    std::vector<Extremes> _extremes; ///< by the leaf's index in its catalogue
};

} // namespace velmora
