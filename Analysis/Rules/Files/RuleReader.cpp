// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/RuleReader.h"

#include "Analysis/Events/EventKind.h"
#include "Analysis/Rules/Expression/ExpressionParser.h"
#include "Analysis/Rules/Files/RuleTestReader.h"
#include "Analysis/Rules/Files/RuleText.h"
#include "Analysis/Rules/Files/TableReader.h"
#include "Analysis/Rules/Files/TechnologyNames.h"
#include "Platform/PrintableText.h"

#include <algorithm>
#include <array>
#include <string_view>
#include <utility>
#include <variant>

namespace velmora {

namespace {

constexpr std::array<std::string_view, 10> ruleKeys{"name", "when",       "for",  "clear",    "keep",
                                                    "text", "technology", "test", "severity", "lasts"};

bool isKindName(std::string_view name) {
    constexpr std::size_t longest = 64;
    const auto isLetter = [](char c) { return c >= 'a' && c <= 'z'; };
    return !name.empty() && name.size() <= longest && isLetter(name[0]) && !name.ends_with('-') &&
           std::all_of(name.begin(), name.end(),
                       [&](char c) { return isLetter(c) || (c >= '0' && c <= '9') || c == '-'; });
}

} // namespace

std::vector<Rule> RuleReader::read(const TOMLNode& document) {
    static constexpr std::array<std::string_view, 2> keys{"rule", "class"}; // classes have their own reader
    std::vector<Rule> rules;
    TableReader top(document, keys, _errors);
    const TOMLNode* const all = top.find("rule", TOMLNode::Kind::Array);
    if (!all)
        return rules;
    for (const TOMLNode& each : all->items) {
        if (_errors.isFull())
            break;
        if (each.kind != TOMLNode::Kind::Table)
            _errors.add(each.position, "got " + std::string(nameOf(each.kind)) + ", wanted [[rule]] tables");
        else if (std::optional<Rule> rule = readRule(each))
            rules.push_back(std::move(*rule));
    }
    return rules;
}

std::optional<Rule> RuleReader::readRule(const TOMLNode& table) {
    const std::size_t errorsBefore = _errors.count();
    Rule rule;
    rule.line = table.position.line;
    rule.column = table.position.column;
    TableReader keys(table, ruleKeys, _errors);
    if (const TOMLNode* const name = keys.require("name", TOMLNode::Kind::Text)) {
        rule.name = name->text;
        const EventKindRow* const kind = eventKindNamed(rule.name);
        if (!isKindName(rule.name))
            _errors.add(name->position, "got the name " + printableLine(rule.name.substr(0, 64)) +
                                            ", wanted lower-case letters, digits and hyphens as in "
                                            "weak-coverage, at most 64");
        else if (kind && !kind->isOfRule)
            _errors.add(name->position,
                        "got the name " + rule.name + ", which events have that no rule makes");
    }
    if (const TOMLNode* const technology = table.find("technology"))
        readTechnologies(*technology, rule.technologies);
    const InputNames* const chosen = namesFor(rule.technologies);
    if (!chosen) {
        _errors.add(table.position,
                    "got more than " + std::to_string(mostChoices) + " choices of technologies");
        return std::nullopt;
    }
    const InputNames& names = *chosen;
    if (const TOMLNode* const when = keys.require("when", TOMLNode::Kind::Text))
        if (std::optional<Expression> condition = readCondition(*when, names)) {
            rule.when = std::move(*condition);
            if (rule.when.inputs.empty())
                _errors.add(when->position, "got a condition that reads nothing, wanted a role or a path");
        }
    if (const TOMLNode* const clear = keys.find("clear", TOMLNode::Kind::Text))
        rule.clear = readCondition(*clear, names);
    rule.holdFor = keys.findSpan("for").value_or(Time::duration(0));
    rule.keep = keys.findSpan("keep").value_or(Time::duration(0));
    if (const TOMLNode* const lasts = keys.find("lasts", TOMLNode::Kind::Flag))
        rule.lasts = lasts->flag;
    if (const TOMLNode* const severity = keys.find("severity", TOMLNode::Kind::Text)) {
        const std::optional<Severity> named = severityNamed(severity->text);
        if (!named)
            _errors.add(severity->position, "got the severity " +
                                                printableLine(severity->text.substr(0, 64)) +
                                                ", wanted info, warning or critical");
        rule.severity = named.value_or(Severity::Warning);
    }
    if (const TOMLNode* const text = keys.require("text", TOMLNode::Kind::Text)) {
        rule.text = text->text;
        rule.textParts = readRuleText(*text, names, _errors);
    }
    if (_errors.count() == errorsBefore)
        if (const TOMLNode* const tests = keys.find("test", TOMLNode::Kind::Array))
            rule.tests = RuleTestReader(rule, names, _errors).read(*tests);
    return _errors.count() == errorsBefore ? std::optional(std::move(rule)) : std::nullopt;
}

const InputNames* RuleReader::namesFor(const std::vector<std::string>& technologies) {
    if (const auto found = _names.find(technologies); found != _names.end())
        return &found->second;
    if (_names.size() == mostChoices)
        return nullptr;
    std::vector<const Catalogue*> chosen;
    for (const Catalogue* const each : _catalogues)
        if (technologies.empty() ||
            std::find(technologies.begin(), technologies.end(), each->technology()) != technologies.end())
            chosen.push_back(each);
    // Messages of IFX may have any paths: without a technology a mistyped one would never be noticed.
    const auto further =
        technologies.empty() ? InputNames::Further::AreMistakes : InputNames::Further::ArePossible;
    return &_names.emplace(technologies, InputNames(std::move(chosen), further)).first->second;
}

void RuleReader::readTechnologies(const TOMLNode& node, std::vector<std::string>& technologies) {
    const auto addNamed = [&](const TOMLNode& name) {
        const bool isText = name.kind == TOMLNode::Kind::Text;
        if (const Catalogue* const named = isText ? catalogueNamed(_catalogues, name.text) : nullptr) {
            technologies.push_back(named->technology());
            return;
        }
        std::string all;
        for (const Catalogue* const each : _catalogues)
            all.append(all.empty() ? "" : ", ").append(each->technology());
        const std::string got = isText ? "the technology " + printableLine(name.text.substr(0, 64))
                                       : std::string(nameOf(name.kind));
        _errors.add(name.position, "got " + got + ", wanted one or an array of " + all);
    };
    if (node.kind == TOMLNode::Kind::Array && !node.items.empty() && node.items.size() <= _catalogues.size())
        std::for_each(node.items.begin(), node.items.end(), addNamed);
    else
        addNamed(node);
}

std::optional<Expression> RuleReader::readCondition(const TOMLNode& text, const InputNames& names) {
    auto parsed = parseExpression(text.text, names);
    if (const auto* const mistake = std::get_if<ExpressionError>(&parsed)) {
        _errors.addInText(text, mistake->position, mistake->text);
        return std::nullopt;
    }
    std::optional<Expression> expression(std::get<Expression>(std::move(parsed)));
    if (expression->type().kind != ExpressionType::Kind::Truth) {
        _errors.add(text.position, "got " + describe(expression->type()) + ", wanted a condition");
        return std::nullopt;
    }
    return expression;
}

} // namespace velmora
