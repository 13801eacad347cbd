// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/Expression.h"

#include <cmath>
#include <limits>

namespace velmora {

// Inside an expression a number, or a condition as 1 or 0, is a plain double: unknown is NaN, which no known
// one is.

inline constexpr double unknownNumber = std::numeric_limits<double>::quiet_NaN();

[[nodiscard]] inline bool isKnownNumber(double number) {
    return !std::isnan(number);
}

/// Unknown for what is no finite number, such as a quotient by 0.
[[nodiscard]] inline double finiteNumber(double number) {
    return std::isfinite(number) ? number : unknownNumber;
}

[[nodiscard]] inline double truthNumber(bool holds) {
    return holds ? 1 : 0;
}

[[nodiscard]] inline double negation(double condition) {
    return isKnownNumber(condition) ? truthNumber(condition == 0) : condition;
}

/// Of `and` and `or`, where a condition that is `decisive` decides alone.
[[nodiscard]] inline double connection(bool decisive, double first, double second) {
    if (isKnownNumber(first) && (first != 0) == decisive)
        return first;
    if (isKnownNumber(second) && (second != 0) == decisive)
        return second;
    return isKnownNumber(first) ? second : first;
}

/// Calls `use(function)` with the function of two numbers that the operation is; false where it is none.
template <class Use>
bool withBinaryOperation(ExpressionNode::Operation operation, Use use) {
    using Operation = ExpressionNode::Operation;
    const auto comparison = [&use](auto compare) {
        use([compare](double left, double right) {
            return isKnownNumber(left) && isKnownNumber(right) ? truthNumber(compare(left, right))
                                                               : unknownNumber;
        });
        return true;
    };
    const auto arithmetic = [&use](auto compute) {
        // What is computed of NaN is NaN.
        use([compute](double left, double right) { return finiteNumber(compute(left, right)); });
        return true;
    };
    switch (operation) {
    case Operation::Equal: return comparison([](double left, double right) { return left == right; });
    case Operation::Unequal: return comparison([](double left, double right) { return left != right; });
    case Operation::Less: return comparison([](double left, double right) { return left < right; });
    case Operation::LessOrEqual: return comparison([](double left, double right) { return left <= right; });
    case Operation::Greater: return comparison([](double left, double right) { return left > right; });
    case Operation::GreaterOrEqual:
        return comparison([](double left, double right) { return left >= right; });
    case Operation::Add: return arithmetic([](double left, double right) { return left + right; });
    case Operation::Subtract: return arithmetic([](double left, double right) { return left - right; });
    case Operation::Multiply: return arithmetic([](double left, double right) { return left * right; });
    case Operation::Divide: return arithmetic([](double left, double right) { return left / right; });
    default: return false;
    }
}

} // namespace velmora
