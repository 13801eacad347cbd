// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/RuleState.h"

#include "Analysis/Rules/Expression/RuleUnit.h"

#include <algorithm>
#include <chrono>
#include <cstddef>
#include <utility>

namespace velmora {

namespace {

using Outcome = RuleProgress::Outcome;

/// The inputs whose levels and qualities the expression reads. Other values, such as states, are often
/// reported only when they change; and that a value has an age, or is known, is no measurement.
std::vector<std::uint32_t> measuredInputs(const Expression& expression) {
    using Operation = ExpressionNode::Operation;
    std::vector<std::uint32_t> inputs;
    for (std::size_t i = 0; i < expression.nodes.size(); ++i) {
        const ExpressionNode& node = expression.nodes[i];
        const auto readsNoValue = [i](const ExpressionNode& other) {
            return (other.operation == Operation::Age || other.operation == Operation::Known) &&
                   other.first == i;
        };
        const bool readsValue = node.operation == Operation::Input &&
                                std::none_of(expression.nodes.begin(), expression.nodes.end(), readsNoValue);
        if (readsValue && (node.type.unit == Unit::DBm || node.type.unit == Unit::DB))
            inputs.push_back(node.input);
    }
    return inputs;
}

RuleValue opposite(const RuleValue& value) {
    return value.isKnown() ? RuleValue::truth(value.isFalse()) : value;
}

Unit unitOf(const Expression& expression) {
    return expression.type().kind == ExpressionType::Kind::Number ? expression.type().unit : Unit::None;
}

std::string shown(const RuleValue& value, const Expression& expression) {
    if (!value.isKnown())
        return "unknown";
    if (value.hasText)
        return std::string(value.text);
    if (expression.type().kind == ExpressionType::Kind::Truth)
        return value.isTrue() ? "yes" : "no";
    return numberWithUnit(value.number, unitOf(expression));
}

EventField::Value fieldValue(const RuleValue& value, const Expression& expression) {
    if (value.hasText)
        return std::string(value.text);
    if (expression.type().kind == ExpressionType::Kind::Truth)
        return value.isTrue();
    return value.number;
}

} // namespace

RuleState::RuleState(std::shared_ptr<const Rule> rule, InputStore& inputs, std::string technology)
    : _rule(std::move(rule)), _technology(std::move(technology)), _when(_rule->when, inputs),
      _progress(*_rule) {
    for (const std::uint32_t each : measuredInputs(_rule->when))
        _measured.push_back(_when.slots()[each]);
    if (_rule->clear)
        _clear.emplace(*_rule->clear, inputs);
    for (const RuleTextPart& each : _rule->textParts)
        if (each.value)
            _texts.emplace_back(*each.value, inputs);
}

std::vector<std::uint32_t> RuleState::slots() const {
    std::vector<std::uint32_t> slots(_when.slots().begin(), _when.slots().end());
    if (_clear)
        slots.insert(slots.end(), _clear->slots().begin(), _clear->slots().end());
    std::sort(slots.begin(), slots.end());
    slots.erase(std::unique(slots.begin(), slots.end()), slots.end());
    return slots;
}

Wakeup RuleState::evaluate(const InputStore& inputs, EventSink& sink) {
    Wakeup wakeup;
    const RuleValue when = _when.evaluate(inputs, wakeup);
    // Most of the time nothing has begun that could end. What looks back in time has to look all the same.
    const bool canEnd =
        _progress.hasBegun() || when.isTrue() || (_clear && !_clear->expression().windows.empty());
    const RuleValue ends = !_clear ? opposite(when) : canEnd ? _clear->evaluate(inputs, wakeup) : RuleValue();
    if (_progress.isActive() && when.isTrue() && isTouched(inputs))
        _evidence.add(inputs.message());
    const bool isConfirmed = isConfirming(inputs);
    for (;;) {
        const Outcome outcome = _progress.step(inputs.now(), when, ends, isConfirmed, wakeup);
        switch (outcome) {
        case Outcome::Nothing: return wakeup;
        case Outcome::Starts:
            _evidence.clear();
            _evidence.addFirst(reporters(inputs));
            _evidence.add(inputs.message());
            break;
        case Outcome::Begins: begin(inputs, sink); break;
        case Outcome::Ends:
        case Outcome::Lost: end(_progress.end(), sink); break;
        }
    }
}

void RuleState::interrupt(EventSink& sink) {
    if (_progress.isActive())
        end(_progress.end(), sink);
    _progress.reset();
    _when.clear();
    if (_clear)
        _clear->clear();
}

void RuleState::begin(const InputStore& inputs, EventSink& sink) {
    _evidence.add(inputs.message());
    _event = {};
    _event.time = _progress.begin();
    _event.lasts = _rule->lasts;
    _event.kind = _rule->name;
    _event.severity = _rule->severity;
    _event.technology = _technology;
    _event.evidence = _evidence.messages();
    fillText(inputs);
    if (_event.lasts)
        sink.began(_event);
    else
        sink.happened(_event);
}

void RuleState::end(std::optional<Time> time, EventSink& sink) {
    _progress.reset();
    if (!_event.lasts)
        return;
    _event.end = time;
    _event.evidence = _evidence.messages();
    if (time)
        _event.fields.push_back(
            {"duration", std::chrono::duration<double>(*time - _event.time).count(), Unit::Second});
    sink.happened(_event);
}

void RuleState::fillText(const InputStore& inputs) {
    std::size_t next = 0;
    for (const RuleTextPart& part : _rule->textParts) {
        if (!part.value) {
            _event.text += part.words;
            continue;
        }
        Wakeup ignored; // the text is that of the event's begin
        const RuleValue value = _texts[next++].evaluate(inputs, ignored);
        _event.text += shown(value, *part.value);
        const bool isFirstNumber = !_event.field("value") && value.hasNumber && !value.hasText;
        if (value.isKnown() && !_event.field(part.words))
            _event.fields.push_back(
                {isFirstNumber ? "value" : part.words, fieldValue(value, *part.value), unitOf(*part.value)});
    }
}

std::vector<MessageNumber> RuleState::reporters(const InputStore& inputs) const {
    std::vector<MessageNumber> messages;
    for (const std::uint32_t slot : _when.slots())
        for (const InputCell& cell : inputs.slot(slot).cells)
            if (cell.isKnown() && messages.size() < Event::mostEvidence / 2)
                messages.push_back(cell.message);
    return messages;
}

bool RuleState::isConfirming(const InputStore& inputs) const {
    return _measured.empty() ||
           std::any_of(_measured.begin(), _measured.end(),
                       [&inputs](std::uint32_t slot) { return inputs.isReported(slot); });
}

bool RuleState::isTouched(const InputStore& inputs) const {
    return std::any_of(_when.slots().begin(), _when.slots().end(),
                       [&inputs](std::uint32_t slot) { return inputs.isTouched(slot); });
}

} // namespace velmora
