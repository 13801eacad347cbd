// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/Evaluator.h"

#include "Analysis/Rules/Evaluation/NumberOperations.h"

#include <algorithm>
#include <chrono>
#include <cmath>

namespace velmora {

namespace {

using Operation = ExpressionNode::Operation;

double combine(Operation operation, double first, double second) {
    double result = unknownNumber;
    withBinaryOperation(operation, [&](auto function) { result = function(first, second); });
    return result;
}

double numberOf(const RuleValue& value) {
    return value.hasNumber ? value.number : unknownNumber;
}

double inSeconds(Time::duration span) {
    return std::chrono::duration<double>(span).count();
}

} // namespace

RuleValue Evaluator::evaluate(std::uint32_t index) {
    const ExpressionNode& node = _expression.nodes[index];
    switch (node.operation) {
    case Operation::Text: return RuleValue::of(std::string_view(node.text));
    case Operation::Input: return inputValue(node.input);
    default: return RuleValue::of(number(index));
    }
}

double Evaluator::number(std::uint32_t index) {
    const ExpressionNode& node = _expression.nodes[index];
    switch (node.operation) {
    case Operation::Number: return finiteNumber(node.number);
    case Operation::Text: return unknownNumber;
    case Operation::Truth: return truthNumber(node.number != 0);
    case Operation::Input: return inputNumber(node.input);
    case Operation::Not: return negation(number(node.first));
    case Operation::And:
    case Operation::Or: return connect(node);
    case Operation::In:
    case Operation::Equal:
    case Operation::Unequal: return compared(index);
    case Operation::Less:
    case Operation::LessOrEqual:
    case Operation::Greater:
    case Operation::GreaterOrEqual: return compare(node);
    case Operation::Age: _wakeup.atNextMessage = true; return age(node);
    case Operation::Known: return truthNumber(inputValue(node.input).isKnown());
    case Operation::Changed: {
        const InputCell* const found = cell(node.input);
        if (!found || !found->isKnown())
            return unknownNumber;
        const bool isNow = found->turn == _inputs.turn() && found->hasChanged;
        _wakeup.atNextMessage = _wakeup.atNextMessage || isNow;
        return truthNumber(isNow);
    }
    case Operation::Delta:
    case Operation::CountInWindow: return numberOf(_windows[node.window]);
    case Operation::CountEach:
    case Operation::Any:
    case Operation::All:
    case Operation::Maximum:
    case Operation::Minimum: return goThrough(node);
    default: return compute(node);
    }
}

double Evaluator::compared(std::uint32_t index) {
    const ExpressionNode& node = _expression.nodes[index];
    const auto again = [&] { return node.operation == Operation::In ? isAmong(node) : compare(node); };
    return _kept.has(index) ? _kept.result(index, _inputs, _slots, again) : again();
}

double Evaluator::connect(const ExpressionNode& node) {
    const bool decisive = node.operation == Operation::Or;
    const double first = number(node.first);
    // The other one cannot change the value before this one does.
    if (isKnownNumber(first) && (first != 0) == decisive)
        return first;
    const double second = number(node.second);
    if (isKnownNumber(second) && (second != 0) == decisive)
        return second;
    return isKnownNumber(first) ? second : first;
}

double Evaluator::compare(const ExpressionNode& node) {
    const ExpressionNode& first = _expression.nodes[node.first];
    const ExpressionNode& second = _expression.nodes[node.second];
    const bool asksEqual = node.operation == Operation::Equal || node.operation == Operation::Unequal;
    if (asksEqual && mayBeText(first) && mayBeText(second)) {
        const RuleValue left = evaluate(node.first);
        const RuleValue right = evaluate(node.second);
        if (left.hasText && right.hasText)
            return truthNumber((left.text == right.text) == (node.operation == Operation::Equal));
        return combine(node.operation, numberOf(left), numberOf(right));
    }
    const bool isAgeFirst = first.operation == Operation::Age && second.operation == Operation::Number;
    const bool isAgeSecond = second.operation == Operation::Age && first.operation == Operation::Number;
    const double left = isAgeFirst ? age(first) : number(node.first);
    const double right = isAgeSecond ? age(second) : number(node.second);
    if (isAgeFirst)
        wakeForAge(first, second);
    if (isAgeSecond)
        wakeForAge(second, first);
    return combine(node.operation, left, right);
}

bool Evaluator::mayBeText(const ExpressionNode& node) const {
    return node.operation == Operation::Text ||
           (node.operation == Operation::Input &&
            _expression.inputs[node.input].kind != RuleInput::Kind::EachNeighbour);
}

double Evaluator::isAmong(const ExpressionNode& node) {
    const RuleValue left = evaluate(node.first);
    bool isComparable = false;
    for (std::uint32_t i = 0; i < node.choiceCount; ++i) {
        const ExpressionChoice& choice = _expression.choices[node.choices + i];
        if (choice.isText ? !left.hasText : !left.hasNumber)
            continue;
        isComparable = true;
        if (choice.isText ? left.text == choice.text
                          : left.number >= choice.lowest && left.number <= choice.highest)
            return truthNumber(true);
    }
    return isComparable ? truthNumber(false) : unknownNumber;
}

double Evaluator::compute(const ExpressionNode& node) {
    const double first = number(node.first);
    if (!isKnownNumber(first))
        return first;
    if (node.operation == Operation::Negate)
        return -first;
    if (node.operation == Operation::Absolute)
        return std::abs(first);
    return combine(node.operation, first, number(node.second));
}

double Evaluator::age(const ExpressionNode& node) const {
    if (_expression.inputs[node.input].kind == RuleInput::Kind::EachNeighbour)
        return inSeconds(_inputs.now() - _neighbour->time);
    const InputCell* const found = cell(node.input);
    return found && found->isKnown() ? inSeconds(_inputs.now() - found->time) : unknownNumber;
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
        if (_columns.canEvaluate(node)) {
            const ColumnEvaluator::Column column = _columns.evaluate(node, _inputs.neighbourColumns(), *this);
            const std::size_t count = _inputs.neighbourColumns().size();
            if (column.step == 0 && count != 0)
                each(*column.values, count);
            else
                std::for_each(column.values, column.values + count,
                              [&each](double value) { each(value, 1); });
            return count != 0;
        }
        for (const Neighbour& neighbour : _inputs.neighbours()) {
            _neighbour = &neighbour;
            each(number(node.first), 1);
            hasAny = true;
        }
        _neighbour = nullptr;
        return hasAny;
    }
    for (const InputCell& row : _inputs.slot(_slots[input]).cells) {
        _row = &row;
        each(number(node.first), 1);
        hasAny = true;
    }
    _row = nullptr;
    return hasAny;
}

double Evaluator::goThrough(const ExpressionNode& node) {
    std::size_t trueOnes = 0;
    bool hasUnknown = false;
    bool hasFalse = false;
    double most = unknownNumber;
    const bool isLeast = node.operation == Operation::Minimum;
    const bool isMost = isLeast || node.operation == Operation::Maximum;
    const bool hasAny = forEach(node, [&](double value, std::size_t times) {
        if (!isKnownNumber(value)) {
            hasUnknown = true;
            return;
        }
        hasFalse = hasFalse || value == 0;
        trueOnes += value != 0 ? times : 0;
        if (isMost && (!isKnownNumber(most) || (isLeast ? value < most : value > most)))
            most = value;
    });
    if (!hasAny)
        return unknownNumber;
    const auto count = static_cast<double>(trueOnes);
    switch (node.operation) {
    case Operation::CountEach: return count;
    case Operation::Any: return count > 0 || !hasUnknown ? truthNumber(count > 0) : unknownNumber;
    case Operation::All: return hasFalse || !hasUnknown ? truthNumber(!hasFalse) : unknownNumber;
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

double Evaluator::inputNumber(std::uint32_t input) const {
    const RuleInput& read = _expression.inputs[input];
    if (read.kind == RuleInput::Kind::EachNeighbour)
        return NeighbourColumns::valueOf(*_neighbour, read.role);
    const InputCell* const found = cell(input);
    if (!found)
        return unknownNumber;
    switch (found->kind) {
    case ObservedKind::Number:
    case ObservedKind::Flag:
    case ObservedKind::Enumeration: return finiteNumber(found->number);
    default: return unknownNumber;
    }
}

RuleValue Evaluator::inputValue(std::uint32_t input) const {
    const RuleInput& read = _expression.inputs[input];
    if (read.kind == RuleInput::Kind::EachNeighbour)
        return RuleValue::of(NeighbourColumns::valueOf(*_neighbour, read.role));
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
