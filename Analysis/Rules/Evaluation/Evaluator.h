// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Evaluation/InputStore.h"
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
              std::span<const RuleValue> windows, Wakeup& wakeup)
        : _expression(expression), _slots(slots), _inputs(inputs), _windows(windows), _wakeup(wakeup) {}

    [[nodiscard]] RuleValue value() {
        return evaluate(static_cast<std::uint32_t>(_expression.nodes.size() - 1));
    }
    [[nodiscard]] RuleValue evaluate(std::uint32_t node);

private:
    [[nodiscard]] RuleValue connect(const ExpressionNode& node);
    [[nodiscard]] RuleValue compare(const ExpressionNode& node);
    [[nodiscard]] RuleValue isAmong(const ExpressionNode& node);
    [[nodiscard]] RuleValue compute(const ExpressionNode& node);
    [[nodiscard]] RuleValue age(const ExpressionNode& node) const;
    [[nodiscard]] RuleValue goThrough(const ExpressionNode& node);
    /// Calls `each` for every neighbour or row. False where there is none.
    template <class Each>
    bool forEach(const ExpressionNode& node, Each each);
    /// Null where the input has none in the current row.
    [[nodiscard]] const InputCell* cell(std::uint32_t input) const;
    [[nodiscard]] RuleValue inputValue(std::uint32_t input) const;
    /// Evaluates again when a comparison with an age can have another result.
    void wakeForAge(const ExpressionNode& age, const ExpressionNode& other);

    const Expression& _expression;
    std::span<const std::uint32_t> _slots;
    const InputStore& _inputs;
    std::span<const RuleValue> _windows;
    Wakeup& _wakeup;
    const Neighbour* _neighbour = nullptr; ///< the current one
    const InputCell* _row = nullptr;       ///< whose row is the current one
};

} // namespace velmora
