// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/ColumnEvaluator.h"

#include "Analysis/Rules/Evaluation/Evaluator.h"
#include "Analysis/Rules/Evaluation/NumberOperations.h"

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

std::span<const double> ColumnEvaluator::evaluate(const ExpressionNode& node,
                                                  const NeighbourColumns& neighbours, Evaluator& scalars) {
    _neighbours = &neighbours;
    _scalars = &scalars;
    return {column(node.first).values, neighbours.size()};
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
    const std::size_t count = _neighbours->size();
    values.resize(count);
    if (node.operation == Operation::Known) {
        const std::span<const double> known = _neighbours->of(_expression->inputs[node.input].role);
        for (std::size_t i = 0; i < count; ++i)
            values[i] = truthNumber(isKnownNumber(known[i]));
        return {values.data(), 1};
    }
    const Column first = column(node.first);
    if (isUnary(node.operation)) {
        for (std::size_t i = 0; i < count; ++i)
            values[i] = unary(node.operation, first.values[i * first.step]);
        return {values.data(), 1};
    }
    const Column second = column(node.second);
    const auto combine = [&](auto function) {
        for (std::size_t i = 0; i < count; ++i)
            values[i] = function(first.values[i * first.step], second.values[i * second.step]);
    };
    if (!withBinaryOperation(node.operation, combine))
        combine([decisive = node.operation == Operation::Or](double one, double other) {
            return connection(decisive, one, other);
        });
    return {values.data(), 1};
}

} // namespace velmora
