// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Evaluation/NeighbourColumns.h"
#include "Analysis/Rules/Expression/Expression.h"

#include <cstddef>
#include <cstdint>
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
    /// The values of a node for each neighbour, in their order, NaN where it is unknown; one for all where
    /// `step` is 0, else `step` is 1.
    struct Column {
        const double* values;
        std::size_t step;
    };
    /// The operand's. `scalars` evaluates what is the same for all. Valid until the next call. Precondition:
    /// `canEvaluate`.
    [[nodiscard]] Column evaluate(const ExpressionNode& node, const NeighbourColumns& neighbours,
                                  Evaluator& scalars);

private:
    [[nodiscard]] Column column(std::uint32_t node);
    [[nodiscard]] std::size_t count(const Column& column) const {
        return column.step == 0 ? 1 : _neighbours->size();
    }
    [[nodiscard]] bool isDecided(bool decisive, const Column& first) const;
    /// `function` of what all neighbours have in the first column, and in the second.
    template <class Function>
    [[nodiscard]] Column combine(std::vector<double>& values, const Column& first, const Column& second,
                                 Function function) const;

    const Expression* _expression;
    // By node:
    std::vector<bool> _isSupported;
    std::vector<bool> _isOfNeighbours; ///< another value for each
    std::vector<std::vector<double>> _values;
    const NeighbourColumns* _neighbours = nullptr;
    Evaluator* _scalars = nullptr;
};

} // namespace velmora
