// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/PathInputs.h"

#include "Analysis/Rules/Expression/PathLeaves.h"

#include <algorithm>
#include <optional>
#include <utility>

namespace velmora {

namespace {

ReportedValue valueOf(const Observation& observation) {
    switch (observation.kind) {
    case ObservedKind::Number: return {observation.kind, observation.number};
    case ObservedKind::Flag: return {observation.kind, observation.raw != 0 ? 1.0 : 0.0};
    case ObservedKind::Text: return {observation.kind, 0, observation.words};
    default: return {};
    }
}

bool isInside(const CatalogueNode* node, const CatalogueNode& outer) {
    while (node && node != &outer)
        node = node->parent();
    return node != nullptr;
}

} // namespace

PathInputs::PathInputs(const Catalogue& catalogue, const InputStore& inputs) : _catalogue(catalogue) {
    for (std::uint32_t i = 0; i < inputs.slots().size(); ++i)
        if (const RuleInput& input = inputs.slot(i).input; input.isPath())
            _paths.push_back({i, input.path, input.isEach()});
}

bool PathInputs::reads(const CatalogueField& leaf) const {
    return std::any_of(_paths.begin(), _paths.end(),
                       [&leaf](const Path& each) { return leafAt(leaf, each.path).has_value(); });
}

std::span<const PathInputs::Use> PathInputs::usesOf(const CatalogueField& leaf) {
    // Messages may have named further leaves.
    while (_uses.size() <= leaf.index) {
        const CatalogueField& next = _catalogue.fields()[_uses.size()];
        std::vector<Use>& uses = _uses.emplace_back();
        for (const Path& each : _paths)
            if (std::optional<PathLeaf> found = leafAt(next, each.path))
                uses.push_back({each.slot, std::move(found->rows), each.isEach});
        if (!uses.empty())
            _used.push_back(&next);
    }
    return _uses[leaf.index];
}

void PathInputs::update(const ObservedMessage& message, InputStore& inputs) {
    if (_paths.empty())
        return;
    for (const ObservedList& each : message.lists)
        removeList(*each.list, inputs);
    for (const CatalogueField* const leaf : message.removed)
        remove(*leaf, inputs);
    ObservedText text;
    for (const Observation& each : message.observations) {
        if (usesOf(*each.leaf).empty())
            continue;
        ReportedValue value = valueOf(each);
        if (each.kind == ObservedKind::Enumeration)
            value = {each.kind, static_cast<double>(each.raw), text.of(each)};
        set(*each.leaf, each.rows, value, inputs);
    }
}

void PathInputs::remove(const CatalogueField& leaf, InputStore& inputs) {
    for (const Use& use : usesOf(leaf))
        inputs.remove(use.slot);
}

void PathInputs::set(const CatalogueField& leaf, std::span<const std::uint32_t> rows,
                     const ReportedValue& value, InputStore& inputs) {
    for (const Use& use : usesOf(leaf)) {
        bool isInRows = use.rows.size() <= rows.size();
        for (std::size_t i = 0; isInRows && i < use.rows.size(); ++i)
            isInRows = !use.rows[i] || *use.rows[i] == rows[i];
        if (!isInRows)
            continue;
        if (use.isEach)
            inputs.set(use.slot, value, rows);
        else
            inputs.set(use.slot, value);
    }
}

void PathInputs::removeList(const CatalogueNode& list, InputStore& inputs) {
    for (const CatalogueField* const leaf : _used)
        if (leaf->node != &list && isInside(leaf->node, list))
            for (const Use& use : _uses[leaf->index])
                inputs.remove(use.slot);
}

} // namespace velmora
