// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/ExpressionType.h"
#include "Analysis/Rules/Expression/RuleInput.h"
#include "Platform/Clock.h"

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// One operation of an expression.
struct ExpressionNode {
    enum class Operation : std::uint8_t {
        Number,
        Text,
        Truth,
        Input,
        Not,
        And,
        Or,
        Equal,
        Unequal,
        Less,
        LessOrEqual,
        Greater,
        GreaterOrEqual,
        In,
        Add,
        Subtract,
        Multiply,
        Divide,
        Negate,
        Absolute,
        Age,     ///< of the input
        Known,   ///< of the input
        Changed, ///< of the input
        Delta,   ///< of the input, in a window
        CountInWindow,
        CountEach,
        Any,
        All,
        Maximum,
        Minimum,
    };

    Operation operation = Operation::Truth;
    ExpressionType type{};
    double number = 0;       ///< a constant
    std::string text{};      ///< a constant
    std::uint32_t first = 0; ///< the operand, or the first of two
    std::uint32_t second = 0;
    std::uint32_t input = 0;   ///< index among the expression's inputs
    std::uint32_t window = 0;  ///< index among its windows
    std::uint32_t choices = 0; ///< the first of those of `In`
    std::uint32_t choiceCount = 0;
};

/// What `in` compares with: a text, or the numbers from the lowest to the highest.
struct ExpressionChoice {
    double lowest = 0;
    double highest = 0;
    std::string text;
    bool isText = false;
};

/// A window of time that an operation looks back on.
struct ExpressionWindow {
    Time::duration length{};
    std::uint32_t node = 0;      ///< the operation
    std::uint32_t firstNode = 0; ///< of its operands; these and what they are made of lie before `node`
};

/// A checked expression. Operands lie before the operations that use them; the last node is its value.
struct Expression {
    std::vector<ExpressionNode> nodes;
    std::vector<RuleInput> inputs;
    std::vector<ExpressionChoice> choices;
    std::vector<ExpressionWindow> windows; ///< one in another's operand lies before it

    [[nodiscard]] const ExpressionType& type() const { return nodes.back().type; }

    static constexpr std::size_t mostBytes = 1024; ///< of its text
    static constexpr std::size_t deepest = 32;     ///< of parentheses, calls and signs in each other
    static constexpr std::size_t mostWindows = 8;
    static constexpr std::chrono::hours longestWindow{1};
};

} // namespace velmora
