// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Rule.h"

#include <algorithm>

namespace velmora {

bool concerns(const Rule& rule, const Catalogue& catalogue) {
    const std::vector<std::string>& technologies = rule.technologies;
    if (!technologies.empty() &&
        std::find(technologies.begin(), technologies.end(), catalogue.technology()) == technologies.end())
        return false;
    // The radio technology alone is in every picture.
    return std::any_of(rule.when.inputs.begin(), rule.when.inputs.end(),
                       [&catalogue](const RuleInput& each) {
                           return each.kind != RuleInput::Kind::RadioTechnology && canReport(catalogue, each);
                       }) ||
           std::all_of(rule.when.inputs.begin(), rule.when.inputs.end(),
                       [](const RuleInput& each) { return each.kind == RuleInput::Kind::RadioTechnology; });
}

} // namespace velmora
