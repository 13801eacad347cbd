// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/ColumnEvaluator.h"

#include "Analysis/Rules/Evaluation/Evaluator.h"
#include "Analysis/Rules/Evaluation/NumberOperations.h"

#include <algorithm>

namespace velmora {

namespace {

using Operation = ExpressionNode::Operation;

bool isUnary(Operation operation) {
    return operation == Operation::Not || operation == Operation::Negate || operation == Operation::Absolute;
}

bool isBinary(Operation operation) {
    return operation == Operation::And || operation == Operation::Or ||
           (operation >= Operation::Equal && operation <= Operation::GreaterOrEqual) ||
           (operation >= Operation::Add && operation <= Operation::Divide);
}

double unary(Operation operation, double value) {
    switch (operation) {
    case Operation::Not: return negation(value);
    case Operation::Negate: return -value;
    default: return std::abs(value);
    }
}

} // namespace

ColumnEvaluator::ColumnEvaluator(const Expression& expression)
    : _expression(&expression), _values(expression.nodes.size()) {
    // Operands lie before what is made of them.
    for (const ExpressionNode& node : expression.nodes) {
        const bool isInput = node.operation == Operation::Input || node.operation == Operation::Known;
        const bool isPair = isBinary(node.operation);
        const bool hasOperand = isPair || isUnary(node.operation);
        const auto kind = isInput ? expression.inputs[node.input].kind : RuleInput::Kind::Role;
        const bool isPlain =
            isInput || node.operation == Operation::Number || node.operation == Operation::Truth;
        _isSupported.push_back(hasOperand ? _isSupported[node.first] && (!isPair || _isSupported[node.second])
                                          : isPlain && kind != RuleInput::Kind::EachRow);
        _isOfNeighbours.push_back(hasOperand ? _isOfNeighbours[node.first] ||
                                                   (isPair && _isOfNeighbours[node.second])
                                             : kind == RuleInput::Kind::EachNeighbour);
    }
}

ColumnEvaluator::Column ColumnEvaluator::evaluate(const ExpressionNode& node,
                                                  const NeighbourColumns& neighbours, Evaluator& scalars) {
    _neighbours = &neighbours;
    _scalars = &scalars;
    return column(node.first);
}

/// Whether the first operand of `and` or `or` decides for all neighbours, which is mostly so: the second one
/// need not be evaluated then.
bool ColumnEvaluator::isDecided(bool decisive, const Column& first) const {
    return std::all_of(first.values, first.values + count(first), [decisive](double value) {
        return decisive ? isKnownNumber(value) && value != 0 : value == 0;
    });
}

template <class Function>
ColumnEvaluator::Column ColumnEvaluator::combine(std::vector<double>& values, const Column& first,
                                                 const Column& second, Function function) const {
    const std::size_t rows = _neighbours->size();
    const double* one = first.values;
    const double* other = second.values;
    for (std::size_t i = 0; i < rows; ++i, one += first.step, other += second.step)
        values[i] = function(*one, *other);
    return {values.data(), 1};
}

ColumnEvaluator::Column ColumnEvaluator::column(std::uint32_t index) {
    const ExpressionNode& node = _expression->nodes[index];
    std::vector<double>& values = _values[index];
    if (!_isOfNeighbours[index]) {
        values.assign(1, _scalars->number(index));
        return {values.data(), 0};
    }
    if (node.operation == Operation::Input)
        return {_neighbours->of(_expression->inputs[node.input].role).data(), 1};
    values.resize(std::max(values.size(), _neighbours->size()));
    if (node.operation == Operation::Known) {
        const Column known{_neighbours->of(_expression->inputs[node.input].role).data(), 1};
        return combine(values, known, known,
                       [](double value, double) { return truthNumber(isKnownNumber(value)); });
    }
    const Column first = column(node.first);
    if (isUnary(node.operation))
        return combine(values, first, first, [operation = node.operation](double value, double) {
            return unary(operation, value);
        });
    const bool isOr = node.operation == Operation::Or;
    const bool isConnection = isOr || node.operation == Operation::And;
    if (isConnection && isDecided(isOr, first))
        return first;
    const Column second = column(node.second);
    if (isConnection)
        return combine(values, first, second,
                       [isOr](double one, double other) { return connection(isOr, one, other); });
    withBinaryOperation(node.operation,
                        [&](auto function) { static_cast<void>(combine(values, first, second, function)); });
    return {values.data(), 1};
}

} // namespace velmora
