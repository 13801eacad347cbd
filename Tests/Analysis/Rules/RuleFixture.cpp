// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Analysis/Rules/RuleFixture.h"

#include "Analysis/Rules/Expression/RuleUnit.h"
#include "Platform/TelephonyService.h"
#include "Tests/Support/ShippedResources.h"

#include <gtest/gtest.h>

#include <stdexcept>

namespace velmora {

namespace {

std::string secondsText(Time time) {
    return numberWithUnit(std::chrono::duration<double>(time - at(0)).count(), Unit::None);
}

} // namespace

ShippedCatalogues::ShippedCatalogues() {
    FakeResources resources;
    for (const std::string name : {"LTE", "Ostrel_GSM", "Ostrel_UTRAN", "C2KTemplate", "Modem"})
        resources.put(name, "plist", shippedResource(name + ".plist"));
    for (const std::string_view technology : voxTechnologies) {
        auto decoder = LogGenerator::generatorFromTechnology(technology, _clock);
        _catalogues.push_back(&decoder->catalogue());
        _decoders.push_back(std::move(decoder));
    }
}

const ShippedCatalogues& ShippedCatalogues::instance() {
    static const ShippedCatalogues catalogues;
    return catalogues;
}

const Catalogue& ShippedCatalogues::of(std::string_view technology) const {
    for (const Catalogue* const each : _catalogues)
        if (each->technology() == technology)
            return *each;
    throw std::invalid_argument("no technology " + std::string(technology));
}

LogGenerator& ShippedCatalogues::decoder(std::string_view technology) const {
    for (std::size_t i = 0; i < _catalogues.size(); ++i)
        if (_catalogues[i]->technology() == technology)
            return *_decoders[i];
    throw std::invalid_argument("no technology " + std::string(technology));
}

Time at(double seconds) {
    constexpr std::chrono::hours start(24 * 20000);
    return Time(start) + std::chrono::duration_cast<Time::duration>(std::chrono::duration<double>(seconds));
}

void EventTexts::began(const Event& event) {
    begun.push_back(event.kind + " " + secondsText(event.time));
}

void EventTexts::happened(const Event& event) {
    std::string text = event.kind + " " + secondsText(event.time);
    if (event.lasts)
        text += " to " + (event.end ? secondsText(*event.end) : "?");
    texts.push_back(text);
    events.push_back(event);
}

RuleSet ruleSet(const std::string& text) {
    RuleSet rules(ShippedCatalogues::instance().all());
    rules.add({"my.toml", text, 0});
    for (const RuleError& each : rules.errors())
        ADD_FAILURE() << each.message();
    return rules;
}

std::vector<std::string> mistakesIn(const std::string& text, int layer) {
    RuleSet rules(ShippedCatalogues::instance().all());
    rules.add({"my.toml", text, layer});
    std::vector<std::string> messages;
    for (const RuleError& each : rules.errors())
        messages.push_back(each.message());
    return messages;
}

EvaluatedExpression::EvaluatedExpression(std::string_view text) {
    const std::span<const Catalogue* const> all = ShippedCatalogues::instance().all();
    auto parsed = parseExpression(text, InputNames({all.begin(), all.end()}));
    if (const auto* const mistake = std::get_if<ExpressionError>(&parsed))
        throw std::invalid_argument(mistake->text);
    _expression = std::get<Expression>(std::move(parsed));
    _bound = std::make_unique<BoundExpression>(_expression, _inputs);
    turn(0);
}

EvaluatedExpression& EvaluatedExpression::turn(double seconds) {
    if (_messages > 0)
        (void)value();
    _value.reset();
    _inputs.beginTurn({0, ++_messages}, at(seconds));
    return *this;
}

std::uint32_t EvaluatedExpression::slot(std::string_view name) const {
    for (std::uint32_t i = 0; i < _inputs.slots().size(); ++i) {
        const RuleInput& input = _inputs.slot(i).input;
        const bool isState = input.kind == RuleInput::Kind::RadioTechnology;
        if (input.path == name ||
            (!input.isPath() && (isState ? "radio.technology" : nameOf(input.role)) == name))
            return i;
    }
    throw std::invalid_argument("the expression does not read " + std::string(name));
}

EvaluatedExpression& EvaluatedExpression::set(std::string_view name, double number) {
    _value.reset();
    const RuleInput& input = _inputs.slot(slot(name)).input;
    const bool isEnumeration = input.type.kind == ExpressionType::Kind::Enumeration;
    _inputs.set(slot(name), {isEnumeration ? ObservedKind::Enumeration : ObservedKind::Number, number});
    return *this;
}

EvaluatedExpression& EvaluatedExpression::set(std::string_view name, std::string_view text) {
    _value.reset();
    _inputs.set(slot(name), {ObservedKind::Text, 0, text});
    return *this;
}

EvaluatedExpression& EvaluatedExpression::setRow(std::string_view path, std::uint32_t row, double number) {
    _value.reset();
    _inputs.set(slot(path), {ObservedKind::Number, number}, {&row, 1});
    return *this;
}

EvaluatedExpression& EvaluatedExpression::remove(std::string_view name) {
    _value.reset();
    _inputs.remove(slot(name));
    return *this;
}

EvaluatedExpression& EvaluatedExpression::clear() {
    _value.reset();
    _inputs.clear();
    return *this;
}

EvaluatedExpression& EvaluatedExpression::neighbours(const std::vector<Neighbour>& neighbours) {
    _value.reset();
    _inputs.setNeighbours(neighbours);
    return *this;
}

std::string EvaluatedExpression::value() {
    if (!_value)
        _value = evaluate();
    return *_value;
}

std::string EvaluatedExpression::evaluate() {
    Wakeup wakeup;
    const RuleValue value = _bound->evaluate(_inputs, wakeup);
    if (!value.isKnown())
        return "unknown";
    if (_expression.type().kind == ExpressionType::Kind::Truth)
        return value.isTrue() ? "true" : "false";
    return value.hasText ? std::string(value.text) : numberWithUnit(value.number, _expression.type().unit);
}

Neighbour neighbour(double level, bool isDetected) {
    Neighbour made;
    made.level_dBm = level;
    made.isDetected = isDetected;
    return made;
}

} // namespace velmora
