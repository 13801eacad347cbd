// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/RuleSet.h"

#include "Analysis/Rules/Files/ClassReader.h"
#include "Analysis/Rules/Files/RuleReader.h"
#include "Analysis/Rules/Files/TOMLReader.h"
#include "Analysis/Rules/Rule.h"

#include <algorithm>
#include <numeric>
#include <utility>

namespace velmora {

namespace {

/// Whether there is a technology that both are for.
bool meet(const Rule& a, const Rule& b) {
    return a.technologies.empty() || b.technologies.empty() ||
           std::any_of(a.technologies.begin(), a.technologies.end(), [&b](const std::string& each) {
               return std::find(b.technologies.begin(), b.technologies.end(), each) != b.technologies.end();
           });
}

std::size_t windowsOf(const Rule& rule) {
    return rule.when.windows.size() + (rule.clear ? rule.clear->windows.size() : 0);
}

} // namespace

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
    FileErrors errors(file.name, file.text, file.isBuiltIn ? _leftOut : _errors);
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
    addClasses(file, std::get<TOMLNode>(document));
}

void RuleSet::addClasses(const RuleFile& file, const TOMLNode& document) {
    FileErrors errors(file.name, file.text, file.isBuiltIn ? _leftOutClasses : _errors);
    for (const ClassReader::Class& each : ClassReader(_catalogues, errors).read(document))
        for (const LevelClasses::Subject& subject : each.subjects)
            if (std::string mistake =
                    _classes.add(subject, each.limits, {file.name, each.position.line, file.layer});
                !mistake.empty())
                errors.add(each.position, std::move(mistake));
}

std::string RuleSet::insert(Rule rule) {
    const auto isBefore = [](const std::shared_ptr<const Rule>& each, const std::string& name) {
        return each->name < name;
    };
    const auto first = std::lower_bound(_rules.begin(), _rules.end(), rule.name, isBefore);
    const auto end =
        std::find_if(first, _rules.end(), [&rule](const auto& each) { return each->name != rule.name; });
    if (first != end && (*first)->layer > rule.layer)
        return {};
    if (first != end && (*first)->layer < rule.layer)
        _rules.erase(first, end);
    else if (const auto other =
                 std::find_if(first, end, [&rule](const auto& each) { return meet(*each, rule); });
             other != end)
        return "got a second rule " + rule.name + " for the same technology; the first is at " +
               (*other)->file + ":" + std::to_string((*other)->line);
    if (_rules.size() == mostRules)
        return "got more than " + std::to_string(mostRules) + " rules";
    const std::size_t windows = std::accumulate(
        _rules.begin(), _rules.end(), windowsOf(rule),
        [](std::size_t sum, const std::shared_ptr<const Rule>& each) { return sum + windowsOf(*each); });
    if (windows > mostWindows)
        return "got more than " + std::to_string(mostWindows) + " windows of time in all rules";
    const auto place = std::upper_bound(
        _rules.begin(), _rules.end(), rule.name,
        [](const std::string& name, const std::shared_ptr<const Rule>& each) { return name < each->name; });
    _rules.insert(place, std::make_shared<const Rule>(std::move(rule)));
    return {};
}

std::vector<RuleSet::Summary> RuleSet::summaries() const {
    std::vector<Summary> all;
    for (const auto& rule : _rules)
        if (all.empty() || all.back().name != rule->name)
            all.push_back({rule->name, rule->severity, rule->text, rule->file, rule->lasts});
    return all;
}

} // namespace velmora
