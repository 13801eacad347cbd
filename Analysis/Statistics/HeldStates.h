// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/StateCounts.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <vector>

namespace velmora {

/// The states of a technology that hold now. A state holds from the message that reported it until one
/// reports another value or that there is none. The time that it holds is counted in the statistics that were
/// current meanwhile; null for none.
class HeldStates {
public:
    /// The leaf, whose statistics these are in the current part (null: none), reported that value at that
    /// time.
    void report(const Observation& observation, StateCounts* counts, Time time);
    /// Whether a state of the leaf holds.
    [[nodiscard]] bool holds(const CatalogueField& leaf) const {
        return leaf.index < _held.size() && _held[leaf.index];
    }
    /// The leaf has no value any more.
    void withdraw(const CatalogueField& leaf, Time time);
    /// Up to that time what holds is counted in the earlier part, from then on in another one, where
    /// `countsOf` returns a leaf's statistics.
    void moveTo(const std::function<StateCounts*(const CatalogueField&)>& countsOf, Time time);
    /// Nothing is known from then on.
    void forget(Time time);

private:
    struct Held {
        StateCounts::Value value;
        std::size_t index = 0; ///< in the current part's counts, if there are any
        StateCounts* counts = nullptr;
        Time since{};
    };

    void countTime(Held& held, Time time);

    std::vector<std::optional<Held>> _held;     ///< by the leaf's index in its catalogue
    std::vector<const CatalogueField*> _leaves; ///< all that have held at some time
    ObservedText _texts;
};

} // namespace velmora
