// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/RuleSet.h"

#include "Analysis/Rules/Rule.h"

namespace velmora {

RuleSet::RuleSet(std::span<const Catalogue* const> catalogues)
    : _catalogues(catalogues.begin(), catalogues.end()) {}

RuleSet::~RuleSet() = default;
RuleSet::RuleSet(RuleSet&&) noexcept = default;
RuleSet& RuleSet::operator=(RuleSet&&) noexcept = default;

void RuleSet::add(const RuleFile& file) {
    if (file.text.size() > mostBytes)
        _errors.push_back({file.name, 0, 0,
                           "the file has " + std::to_string(file.text.size()) + " bytes, wanted at most " +
                               std::to_string(mostBytes)});
}

std::vector<RuleSet::Summary> RuleSet::summaries() const {
    std::vector<Summary> all;
    for (const auto& rule : _rules)
        all.push_back({rule->name, rule->severity, rule->text, rule->file, rule->lasts});
    return all;
}

std::vector<std::shared_ptr<const Rule>> RuleSet::rules() const {
    return _rules;
}

} // namespace velmora
