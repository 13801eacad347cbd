// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Evaluation/KeptComparisons.h"

namespace velmora {

namespace {

using Operation = ExpressionNode::Operation;

/// Those of one value: the others have another result for each neighbour or row.
std::optional<std::uint32_t> inputOf(const Expression& expression, std::uint32_t node) {
    const ExpressionNode& read = expression.nodes[node];
    if (read.operation != Operation::Input || expression.inputs[read.input].isEach())
        return std::nullopt;
    return read.input;
}

std::optional<std::uint32_t> comparedInput(const Expression& expression, const ExpressionNode& node) {
    const auto isText = [&expression](std::uint32_t operand) {
        return expression.nodes[operand].operation == Operation::Text;
    };
    if (node.operation == Operation::In)
        return inputOf(expression, node.first);
    if (node.operation != Operation::Equal && node.operation != Operation::Unequal)
        return std::nullopt;
    if (isText(node.second))
        return inputOf(expression, node.first);
    return isText(node.first) ? inputOf(expression, node.second) : std::nullopt;
}

} // namespace

KeptComparisons::KeptComparisons(const Expression& expression) {
    for (const ExpressionNode& node : expression.nodes)
        _results.push_back({comparedInput(expression, node)});
}

} // namespace velmora
