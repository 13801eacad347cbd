// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/Evaluator.h"

#include <algorithm>
#include <chrono>
#include <cmath>

namespace velmora {

namespace {

using Operation = ExpressionNode::Operation;

double inSeconds(Time::duration span) {
    return std::chrono::duration<double>(span).count();
}

} // namespace

RuleValue Evaluator::evaluate(std::uint32_t index) {
    const ExpressionNode& node = _expression.nodes[index];
    switch (node.operation) {
    case Operation::Number: return RuleValue::of(node.number);
    case Operation::Text: return RuleValue::of(std::string_view(node.text));
    case Operation::Truth: return RuleValue::truth(node.number != 0);
    case Operation::Input: return inputValue(node.input);
    case Operation::Not: {
        const RuleValue operand = evaluate(node.first);
        return operand.isKnown() ? RuleValue::truth(operand.isFalse()) : operand;
    }
    case Operation::And:
    case Operation::Or: return connect(node);
    case Operation::In: return isAmong(node);
    case Operation::Equal:
    case Operation::Unequal:
    case Operation::Less:
    case Operation::LessOrEqual:
    case Operation::Greater:
    case Operation::GreaterOrEqual: return compare(node);
    case Operation::Age: _wakeup.atNextMessage = true; return age(node);
    case Operation::Known: return RuleValue::truth(inputValue(node.input).isKnown());
    case Operation::Changed: {
        const InputCell* const found = cell(node.input);
        if (!found || !found->isKnown())
            return RuleValue::unknown();
        const bool isNow = found->turn == _inputs.turn() && found->hasChanged;
        _wakeup.atNextMessage = _wakeup.atNextMessage || isNow;
        return RuleValue::truth(isNow);
    }
    case Operation::Delta:
    case Operation::CountInWindow: return _windows[node.window];
    case Operation::CountEach:
    case Operation::Any:
    case Operation::All:
    case Operation::Maximum:
    case Operation::Minimum: return goThrough(node);
    default: return compute(node);
    }
}

RuleValue Evaluator::connect(const ExpressionNode& node) {
    const bool decisive = node.operation == Operation::Or;
    // Both are evaluated, so that either can ask to be evaluated again.
    const RuleValue first = evaluate(node.first);
    const RuleValue second = evaluate(node.second);
    for (const RuleValue& each : {first, second})
        if (each.isKnown() && each.isTrue() == decisive)
            return each;
    return first.isKnown() ? second : first;
}

RuleValue Evaluator::compare(const ExpressionNode& node) {
    const ExpressionNode& first = _expression.nodes[node.first];
    const ExpressionNode& second = _expression.nodes[node.second];
    const bool isAgeFirst = first.operation == Operation::Age && second.operation == Operation::Number;
    const bool isAgeSecond = second.operation == Operation::Age && first.operation == Operation::Number;
    const RuleValue left = isAgeFirst ? age(first) : evaluate(node.first);
    const RuleValue right = isAgeSecond ? age(second) : evaluate(node.second);
    if (isAgeFirst)
        wakeForAge(first, second);
    if (isAgeSecond)
        wakeForAge(second, first);
    const bool asksEqual = node.operation == Operation::Equal || node.operation == Operation::Unequal;
    if (asksEqual && left.hasText && right.hasText)
        return RuleValue::truth((left.text == right.text) == (node.operation == Operation::Equal));
    if (!left.hasNumber || !right.hasNumber)
        return RuleValue::unknown();
    switch (node.operation) {
    case Operation::Equal: return RuleValue::truth(left.number == right.number);
    case Operation::Unequal: return RuleValue::truth(left.number != right.number);
    case Operation::Less: return RuleValue::truth(left.number < right.number);
    case Operation::LessOrEqual: return RuleValue::truth(left.number <= right.number);
    case Operation::Greater: return RuleValue::truth(left.number > right.number);
    default: return RuleValue::truth(left.number >= right.number);
    }
}

RuleValue Evaluator::isAmong(const ExpressionNode& node) {
    const RuleValue left = evaluate(node.first);
    bool isComparable = false;
    for (std::uint32_t i = 0; i < node.choiceCount; ++i) {
        const ExpressionChoice& choice = _expression.choices[node.choices + i];
        if (choice.isText ? !left.hasText : !left.hasNumber)
            continue;
        isComparable = true;
        if (choice.isText ? left.text == choice.text
                          : left.number >= choice.lowest && left.number <= choice.highest)
            return RuleValue::truth(true);
    }
    return isComparable ? RuleValue::truth(false) : RuleValue::unknown();
}

RuleValue Evaluator::compute(const ExpressionNode& node) {
    const RuleValue first = evaluate(node.first);
    if (!first.hasNumber)
        return RuleValue::unknown();
    if (node.operation == Operation::Negate)
        return RuleValue::of(-first.number);
    if (node.operation == Operation::Absolute)
        return RuleValue::of(std::abs(first.number));
    const RuleValue second = evaluate(node.second);
    if (!second.hasNumber)
        return RuleValue::unknown();
    switch (node.operation) {
    case Operation::Add: return RuleValue::of(first.number + second.number);
    case Operation::Subtract: return RuleValue::of(first.number - second.number);
    case Operation::Multiply: return RuleValue::of(first.number * second.number);
    default: return RuleValue::of(first.number / second.number);
    }
}

RuleValue Evaluator::age(const ExpressionNode& node) const {
    if (_expression.inputs[node.input].kind == RuleInput::Kind::EachNeighbour)
        return RuleValue::of(inSeconds(_inputs.now() - _neighbour->time));
    const InputCell* const found = cell(node.input);
    return found && found->isKnown() ? RuleValue::of(inSeconds(_inputs.now() - found->time))
                                     : RuleValue::unknown();
}

void Evaluator::wakeForAge(const ExpressionNode& age, const ExpressionNode& other) {
    constexpr double longest_s = 1e9;
    const InputCell* const found = cell(age.input);
    if (!found || _row || std::abs(other.number) > longest_s) {
        _wakeup.atNextMessage = true;
        return;
    }
    const Time turns =
        found->time + std::chrono::duration_cast<Time::duration>(std::chrono::duration<double>(other.number));
    // Rounding of the seconds: one evaluation too many does no harm.
    if (_inputs.now() <= turns + std::chrono::microseconds(1)) {
        _wakeup.by(turns);
        _wakeup.atNextMessage = _wakeup.atNextMessage || _inputs.now() >= turns;
    }
}

template <class Each>
bool Evaluator::forEach(const ExpressionNode& node, Each each) {
    // The operand's nodes lie before the node; the parser has checked that its inputs go through one list.
    const std::uint32_t last = static_cast<std::uint32_t>(&node - _expression.nodes.data());
    std::uint32_t input = 0;
    for (std::uint32_t i = last; i-- > 0;)
        if (_expression.nodes[i].operation == Operation::Input &&
            _expression.inputs[_expression.nodes[i].input].isEach()) {
            input = _expression.nodes[i].input;
            break;
        }
    bool hasAny = false;
    if (_expression.inputs[input].kind == RuleInput::Kind::EachNeighbour) {
        for (const Neighbour& neighbour : _inputs.neighbours()) {
            _neighbour = &neighbour;
            each(evaluate(node.first));
            hasAny = true;
        }
        _neighbour = nullptr;
        return hasAny;
    }
    for (const InputCell& row : _inputs.slot(_slots[input]).cells) {
        _row = &row;
        each(evaluate(node.first));
        hasAny = true;
    }
    _row = nullptr;
    return hasAny;
}

RuleValue Evaluator::goThrough(const ExpressionNode& node) {
    double count = 0;
    bool hasUnknown = false;
    bool hasFalse = false;
    RuleValue most;
    const bool hasAny = forEach(node, [&](const RuleValue& value) {
        hasUnknown = hasUnknown || !value.isKnown();
        hasFalse = hasFalse || value.isFalse();
        count += value.isTrue() ? 1 : 0;
        if (value.hasNumber &&
            (!most.hasNumber || (node.operation == Operation::Minimum ? value.number < most.number
                                                                      : value.number > most.number)))
            most = RuleValue::of(value.number);
    });
    if (!hasAny)
        return RuleValue::unknown();
    switch (node.operation) {
    case Operation::CountEach: return RuleValue::of(count);
    case Operation::Any: return count > 0 || !hasUnknown ? RuleValue::truth(count > 0) : RuleValue::unknown();
    case Operation::All: return hasFalse || !hasUnknown ? RuleValue::truth(!hasFalse) : RuleValue::unknown();
    default: return most;
    }
}

const InputCell* Evaluator::cell(std::uint32_t input) const {
    const RuleInput& read = _expression.inputs[input];
    const std::vector<InputCell>& cells = _inputs.slot(_slots[input]).cells;
    if (read.kind == RuleInput::Kind::EachNeighbour)
        return nullptr;
    if (read.kind != RuleInput::Kind::EachRow)
        return cells.empty() ? nullptr : &cells.front();
    const auto found = std::find_if(cells.begin(), cells.end(),
                                    [this](const InputCell& each) { return each.rows == _row->rows; });
    return found == cells.end() ? nullptr : &*found;
}

RuleValue Evaluator::inputValue(std::uint32_t input) const {
    const RuleInput& read = _expression.inputs[input];
    if (read.kind == RuleInput::Kind::EachNeighbour) {
        const ReportedValue value = valueOf(*_neighbour, read.role);
        return value.kind == ObservedKind::Absent ? RuleValue::unknown() : RuleValue::of(value.number);
    }
    const InputCell* const found = cell(input);
    if (!found)
        return RuleValue::unknown();
    switch (found->kind) {
    case ObservedKind::Number:
    case ObservedKind::Flag: return RuleValue::of(found->number);
    case ObservedKind::Text: return RuleValue::of(std::string_view(found->text));
    case ObservedKind::Enumeration: return {found->number, found->text, true, true};
    default: return RuleValue::unknown();
    }
}

} // namespace velmora
