// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/RuleTestReader.h"

#include "Analysis/Rules/Expression/PathLeaves.h"
#include "Analysis/Rules/Files/TableReader.h"
#include "Platform/PrintableText.h"

#include <algorithm>
#include <array>
#include <optional>
#include <utility>

namespace velmora {

namespace {

using Kind = TOMLNode::Kind;

constexpr std::array<std::string_view, 4> testKeys{"name", "technology", "values", "events"};
constexpr std::array<std::string_view, 3> eventKeys{"begin", "end", "text"};
constexpr std::array<std::string_view, 5> neighbourKeys{"level", "quality", "channel", "physical-cell",
                                                        "detected"};
constexpr std::array<std::string_view, 4> stepKeys{"at", "unknown", "neighbours", "interruption"};

bool isStepKey(std::string_view key) {
    return std::find(stepKeys.begin(), stepKeys.end(), key) != stepKeys.end();
}

/// The kind of the value where it suits the type.
std::optional<ObservedKind> kindOf(const TOMLNode& value, const ExpressionType& type) {
    using Type = ExpressionType::Kind;
    const bool isEnumeration = type.kind == Type::Enumeration;
    const bool canBeNumber = type.kind == Type::Number || type.kind == Type::Any;
    const bool canBeText = type.kind == Type::Text || type.kind == Type::Any;
    if (value.kind == Kind::Flag && type.kind == Type::Truth)
        return ObservedKind::Flag;
    if (value.kind == Kind::Number && (canBeNumber || isEnumeration))
        return isEnumeration ? ObservedKind::Enumeration : ObservedKind::Number;
    if (value.kind == Kind::Text && (canBeText || isEnumeration))
        return isEnumeration ? ObservedKind::Enumeration : ObservedKind::Text;
    return std::nullopt;
}

} // namespace

std::vector<RuleTest> RuleTestReader::read(const TOMLNode& tests) {
    std::vector<RuleTest> all;
    for (const TOMLNode& each : tests.items) {
        if (_errors.isFull())
            break;
        if (each.kind == Kind::Table)
            all.push_back(readTest(each));
        else
            _errors.add(each.position,
                        "got " + std::string(nameOf(each.kind)) + ", wanted [[rule.test]] tables");
    }
    return all;
}

RuleTest RuleTestReader::readTest(const TOMLNode& table) {
    RuleTest test;
    test.line = table.position.line;
    test.column = table.position.column;
    TableReader keys(table, testKeys, _errors);
    if (const TOMLNode* const name = keys.find("name", Kind::Text))
        test.name = name->text;
    _catalogue = catalogueOf(table);
    if (!_catalogue)
        return test;
    test.technology = _catalogue->technology();
    if (const TOMLNode* const values = keys.require("values", Kind::Array))
        for (const TOMLNode& each : values->items)
            readStep(each, test);
    if (const TOMLNode* const events = keys.require("events", Kind::Array))
        for (const TOMLNode& each : events->items)
            readEvent(each, test);
    return test;
}

const Catalogue* RuleTestReader::catalogueOf(const TOMLNode& table) {
    const TOMLNode* const technology = table.find("technology");
    for (const Catalogue* const each : _names.catalogues())
        if (concerns(_rule, *each) && (!technology || (technology->kind == Kind::Text &&
                                                       each->technology().ends_with(technology->text))))
            return each;
    _errors.add(technology ? technology->position : table.position,
                "got a technology that the rule does not concern");
    return nullptr;
}

void RuleTestReader::readStep(const TOMLNode& table, RuleTest& test) {
    if (table.kind != Kind::Table || !table.find("at")) {
        _errors.add(table.position, "got values without a time, wanted a table as in { at = 5, ... }");
        return;
    }
    RuleTestStep step;
    step.at = spanOf(*table.find("at"), _errors).value_or(Time::duration(0));
    if (!test.steps.empty() && step.at < test.steps.back().at)
        _errors.add(table.position, "got a time before the one above, wanted times in order");
    readValues(table, "", step);
    if (const TOMLNode* const neighbours = table.find("neighbours"))
        readNeighbours(*neighbours, step);
    if (const TOMLNode* const interruption = table.find("interruption"))
        step.isInterruption = interruption->flag;
    if (const TOMLNode* const unknown = table.find("unknown"))
        for (const TOMLNode& each : unknown->items)
            readValue(each.text, each.position, nullptr, step);
    test.steps.push_back(std::move(step));
}

void RuleTestReader::readValues(const TOMLNode& table, const std::string& prefix, RuleTestStep& step) {
    for (const TOMLNode::Entry& each : table.entries) {
        if (prefix.empty() && isStepKey(each.key))
            continue;
        const std::string name = prefix + each.key;
        if (each.value.kind == Kind::Table)
            readValues(each.value, name + ".", step);
        else
            readValue(name, each.position, &each.value, step);
    }
}

void RuleTestReader::readValue(const std::string& name, TextPosition position, const TOMLNode* value,
                               RuleTestStep& step) {
    const bool isPath = name.starts_with('/');
    const Result<RuleInput> input = isPath ? _names.at(name) : InputNames::named(name);
    if (!input) {
        _errors.add(position, input.reason());
        return;
    }
    if (input->isNeighbour())
        _errors.add(position, "got " + name + ", wanted neighbours = [{ level = ... }, ...]");
    if (isPath && leavesAt(*_catalogue, name).empty())
        _errors.add(position, "'" + name + "' is no field of " + _catalogue->technology());
    RuleTestStep::Value read{*input};
    if (value) {
        if (input->kind == RuleInput::Kind::EachRow)
            _errors.add(position, "got * for the rows of a list, wanted the number of one");
        const std::optional<ObservedKind> kind = kindOf(*value, input->type);
        if (!kind)
            _errors.add(value->position,
                        "got " + std::string(nameOf(value->kind)) + ", wanted " + describe(input->type));
        read.kind = kind.value_or(ObservedKind::Absent);
        read.number = value->kind == Kind::Flag ? (value->flag ? 1 : 0) : value->number;
        read.text = value->text;
    }
    step.values.push_back(std::move(read));
}

void RuleTestReader::readNeighbours(const TOMLNode& node, RuleTestStep& step) {
    step.neighbours.emplace();
    if (node.kind != Kind::Array)
        _errors.add(node.position,
                    "got " + std::string(nameOf(node.kind)) + " for neighbours, wanted an array");
    for (const TOMLNode& each : node.items) {
        TableReader keys(each, neighbourKeys, _errors);
        const auto number = [&keys](std::string_view key) {
            const TOMLNode* const found = keys.find(key, Kind::Number);
            return found ? std::optional(found->number) : std::nullopt;
        };
        Neighbour neighbour;
        neighbour.level_dBm = number("level");
        neighbour.quality_dB = number("quality");
        neighbour.channel = number("channel");
        neighbour.physicalCell = number("physical-cell");
        const TOMLNode* const detected = keys.find("detected", Kind::Flag);
        neighbour.isDetected = detected && detected->flag;
        step.neighbours->push_back(neighbour);
    }
}

void RuleTestReader::readEvent(const TOMLNode& table, RuleTest& test) {
    TableReader keys(table, eventKeys, _errors);
    if (!keys.has("begin"))
        _errors.add(table.position, "got no begin, wanted an event as in { begin = 5, end = 12 }");
    RuleTestEvent event;
    event.time = keys.findSpan("begin").value_or(Time::duration(0));
    event.end = keys.findSpan("end");
    if (const TOMLNode* const text = keys.find("text", Kind::Text))
        event.text = text->text;
    test.events.push_back(std::move(event));
}

} // namespace velmora
