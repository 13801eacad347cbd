// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Evaluation/ColumnEvaluator.h"
#include "Analysis/Rules/Evaluation/InputStore.h"
#include "Analysis/Rules/Evaluation/KeptComparisons.h"
#include "Analysis/Rules/Evaluation/RuleValue.h"
#include "Analysis/Rules/Evaluation/Wakeup.h"
#include "Analysis/Rules/Expression/Expression.h"

#include <cstdint>
#include <deque>
#include <span>
#include <utility>
#include <vector>

namespace velmora {

/// An expression with the values that it reads and those that its windows of time keep.
class BoundExpression {
public:
    /// The expression must outlive it.
    BoundExpression(const Expression& expression, InputStore& inputs);

    /// The value in this turn. To be called once in every turn that touches one of its slots, and in those
    /// that it asks for.
    [[nodiscard]] RuleValue evaluate(const InputStore& inputs, Wakeup& wakeup);
    /// Windows forget what they have kept.
    void clear();

    [[nodiscard]] std::span<const std::uint32_t> slots() const { return _slots; }
    [[nodiscard]] const Expression& expression() const { return *_expression; }

    /// Of a window. Older ones are dropped.
    static constexpr std::size_t mostSamples = 1024;

private:
    struct Window {
        std::vector<std::uint32_t> slots;            ///< that the operation reads
        std::deque<std::pair<Time, double>> samples; ///< the oldest first
    };

    void updateDelta(std::size_t index, const InputStore& inputs, Wakeup& wakeup);
    void updateCount(std::size_t index, const InputStore& inputs, Wakeup& wakeup);

    const Expression* _expression;
    std::vector<std::uint32_t> _slots; ///< by input of the expression
    std::vector<Window> _windows;
    std::vector<RuleValue> _windowValues;
    ColumnEvaluator _columns;
    KeptComparisons _kept;
};

} // namespace velmora
