// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/RuleSet.h"

#include "Analysis/Rules/Files/RuleReader.h"
#include "Analysis/Rules/Files/TOMLReader.h"
#include "Analysis/Rules/Rule.h"

#include <algorithm>
#include <utility>

namespace velmora {

RuleSet::RuleSet(std::span<const Catalogue* const> catalogues)
    : _catalogues(catalogues.begin(), catalogues.end()) {}

RuleSet::~RuleSet() = default;
RuleSet::RuleSet(RuleSet&&) noexcept = default;
RuleSet& RuleSet::operator=(RuleSet&&) noexcept = default;

void RuleSet::add(const RuleFile& file) {
    if (file.text.size() > mostBytes) {
        addError({file.name, 0, 0,
                  "got " + std::to_string(file.text.size()) + " bytes, wanted at most " +
                      std::to_string(mostBytes)});
        return;
    }
    FileErrors errors(file.name, file.text, _errors);
    const auto document = readTOML(file.text);
    if (const auto* const mistake = std::get_if<TOMLError>(&document)) {
        errors.add(mistake->position, mistake->text);
        return;
    }
    for (Rule& rule : RuleReader(_catalogues, errors).read(std::get<TOMLNode>(document))) {
        rule.file = file.name;
        rule.layer = file.layer;
        const TextPosition position{rule.line, rule.column};
        if (std::string mistake = insert(std::move(rule)); !mistake.empty())
            errors.add(position, std::move(mistake));
    }
}

std::string RuleSet::insert(Rule rule) {
    const auto place = std::lower_bound(
        _rules.begin(), _rules.end(), rule.name,
        [](const std::shared_ptr<const Rule>& each, const std::string& name) { return each->name < name; });
    if (place != _rules.end() && (*place)->name == rule.name) {
        const Rule& other = **place;
        if (other.layer == rule.layer)
            return "got a second rule " + rule.name + "; the first is at " + other.file + ":" +
                   std::to_string(other.line);
        if (other.layer < rule.layer)
            *place = std::make_shared<const Rule>(std::move(rule));
        return {};
    }
    if (_rules.size() == mostRules)
        return "got more than " + std::to_string(mostRules) + " rules";
    _rules.insert(place, std::make_shared<const Rule>(std::move(rule)));
    return {};
}

std::vector<RuleSet::Summary> RuleSet::summaries() const {
    std::vector<Summary> all;
    for (const auto& rule : _rules)
        all.push_back({rule->name, rule->severity, rule->text, rule->file, rule->lasts});
    return all;
}

} // namespace velmora
