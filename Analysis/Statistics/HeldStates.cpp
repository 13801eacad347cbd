// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/HeldStates.h"

#include <string>
#include <utility>

namespace velmora {

void HeldStates::report(const Observation& observation, StateCounts* counts, Time time) {
    const std::size_t leaf = observation.leaf->index;
    if (leaf >= _held.size())
        _held.resize(leaf + 1);
    std::optional<Held>& held = _held[leaf];
    if (held && held->counts == counts && held->value.key.is(observation)) {
        if (counts)
            counts->addSample(held->index);
        return;
    }
    Held next;
    next.value.key = {observation.kind, observation.raw, {}};
    if (observation.kind == ObservedKind::Text)
        next.value.key = {observation.kind, 0, std::string(observation.words)};
    next.value.text = _texts.of(observation);
    next.counts = counts;
    next.since = time;
    if (counts) {
        next.index = counts->indexOf(next.value);
        counts->addSample(next.index);
    }
    if (held) {
        countTime(*held, time);
        if (counts && next.value.key != held->value.key)
            counts->addTransition(held->counts == counts ? held->index : counts->indexOf(held->value),
                                  next.index);
    } else {
        _leaves.push_back(observation.leaf);
    }
    held = std::move(next);
}

void HeldStates::withdraw(const CatalogueField& leaf, Time time) {
    if (!holds(leaf))
        return;
    countTime(*_held[leaf.index], time);
    _held[leaf.index].reset();
    std::erase(_leaves, &leaf);
}

void HeldStates::countTime(Held& held, Time time) {
    if (held.counts)
        held.counts->addTime(held.index, time - held.since);
    held.since = time;
}

void HeldStates::moveTo(const std::function<StateCounts*(const CatalogueField&)>& countsOf, Time time) {
    for (const CatalogueField* const leaf : _leaves) {
        Held& held = *_held[leaf->index];
        countTime(held, time);
        held.counts = countsOf(*leaf);
        if (held.counts)
            held.index = held.counts->indexOf(held.value);
    }
}

void HeldStates::forget(Time time) {
    for (const CatalogueField* const leaf : _leaves) {
        countTime(*_held[leaf->index], time);
        _held[leaf->index].reset();
    }
    _leaves.clear();
}

} // namespace velmora
