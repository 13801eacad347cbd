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
#include <span>

namespace velmora {

/// Evaluates an expression once. Unknown values make what is computed of them unknown, but for `and` with
/// something false, `or` with something true, and what goes through neighbours or rows.
class Evaluator {
public:
    Evaluator(const Expression& expression, std::span<const std::uint32_t> slots, const InputStore& inputs,
              std::span<const RuleValue> windows, ColumnEvaluator& columns, KeptComparisons& kept,
              Wakeup& wakeup)
        : _expression(expression), _slots(slots), _inputs(inputs), _windows(windows), _columns(columns),
          _kept(kept), _wakeup(wakeup) {}

    [[nodiscard]] RuleValue value() {
        return evaluate(static_cast<std::uint32_t>(_expression.nodes.size() - 1));
    }
    [[nodiscard]] RuleValue evaluate(std::uint32_t node);
    /// The number of a node, 1 or 0 of a condition; NaN where it is unknown or a text.
    [[nodiscard]] double number(std::uint32_t node);

private:
    [[nodiscard]] double compared(std::uint32_t node);
    [[nodiscard]] double connect(const ExpressionNode& node);
    [[nodiscard]] double compare(const ExpressionNode& node);
    [[nodiscard]] bool mayBeText(const ExpressionNode& node) const;
    [[nodiscard]] double isAmong(const ExpressionNode& node);
    [[nodiscard]] double compute(const ExpressionNode& node);
    [[nodiscard]] double age(const ExpressionNode& node) const;
    [[nodiscard]] double goThrough(const ExpressionNode& node);
    /// Calls `each(value, times)` for the operand's value for every neighbour or row, once for several that
    /// have the same. False where there is none.
    template <class Each>
    bool forEach(const ExpressionNode& node, Each each);
    /// Null where the input has none in the current row.
    [[nodiscard]] const InputCell* cell(std::uint32_t input) const;
    [[nodiscard]] RuleValue inputValue(std::uint32_t input) const;
    [[nodiscard]] double inputNumber(std::uint32_t input) const;
    /// Evaluates again when a comparison with an age can have another result.
    void wakeForAge(const ExpressionNode& age, const ExpressionNode& other);

    const Expression& _expression;
    std::span<const std::uint32_t> _slots;
    const InputStore& _inputs;
    std::span<const RuleValue> _windows;
    ColumnEvaluator& _columns; ///< of the same expression
    KeptComparisons& _kept;    ///< the same
    Wakeup& _wakeup;
    const Neighbour* _neighbour = nullptr; ///< the current one
    const InputCell* _row = nullptr;       ///< whose row is the current one
};

} // namespace velmora
