// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Evaluation/NeighbourColumns.h"
#include "Analysis/Rules/Expression/Expression.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

namespace velmora {

class Evaluator;

/// Evaluates the operand of what goes through neighbours for all of them at the same time: operation by
/// operation instead of neighbour by neighbour, which takes a fraction of the time.
class ColumnEvaluator {
public:
    /// The expression must outlive it.
    explicit ColumnEvaluator(const Expression& expression);

    /// Whether it can evaluate the operand of that node: one of neighbours that does not depend on time.
    [[nodiscard]] bool canEvaluate(const ExpressionNode& node) const {
        return _isSupported[node.first] && _isOfNeighbours[node.first];
    }
    /// The operand's value for each neighbour, in their order, NaN where it is unknown. `scalars` evaluates
    /// what is the same for all. Valid until the next call. Precondition: `canEvaluate`.
    [[nodiscard]] std::span<const double> evaluate(const ExpressionNode& node,
                                                   const NeighbourColumns& neighbours, Evaluator& scalars);

private:
    /// The values of a node; one for all neighbours where `step` is 0.
    struct Column {
        const double* values;
        std::size_t step;
    };

    [[nodiscard]] Column column(std::uint32_t node);

    const Expression* _expression;
    // By node:
    std::vector<bool> _isSupported;
    std::vector<bool> _isOfNeighbours; ///< another value for each
    std::vector<std::vector<double>> _values;
    const NeighbourColumns* _neighbours = nullptr;
    Evaluator* _scalars = nullptr;
};

} // namespace velmora
