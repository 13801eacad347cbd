// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Samples/SelectedLeaves.h"

namespace velmora {

SelectedLeaves::SelectedLeaves(const NodeSelection& selection) {
    for (const std::string& path : selection.paths())
        _patterns.emplace_back(path);
    if (_patterns.empty())
        _patterns.emplace_back("/");
}

std::span<const SelectedLeaves::Choice> SelectedLeaves::of(const CatalogueField& leaf) {
    while (_choices.size() <= leaf.index)
        _choices.emplace_back();
    std::vector<Choice>& choices = _choices[leaf.index];
    // A leaf that nothing selects has one choice without rows, so that it is looked up once.
    if (choices.empty()) {
        for (std::size_t i = 0; i < _patterns.size(); ++i)
            if (auto rows = _patterns[i].select(leaf))
                choices.push_back({i, *std::move(rows)});
        if (choices.empty())
            choices.push_back({_patterns.size(), {}});
    }
    if (choices.front().path == _patterns.size())
        return {};
    return choices;
}

const SelectedLeaves::Choice* SelectedLeaves::of(const Observation& observation) {
    for (const Choice& choice : of(*observation.leaf))
        if (isInRows(observation, choice.rows))
            return &choice;
    return nullptr;
}

} // namespace velmora
