// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/Expression.h"
#include "Platform/Result.h"

#include <string>

namespace velmora {

/// Why two values cannot be compared so; empty where they can.
[[nodiscard]] std::string comparisonMistake(ExpressionNode::Operation operation, const ExpressionType& left,
                                            const ExpressionType& right);

/// The type of a sum, difference, product or quotient; the reason says why there is none.
[[nodiscard]] Result<ExpressionType> arithmeticType(ExpressionNode::Operation operation,
                                                    const ExpressionType& left, const ExpressionType& right);

/// Whether the value is a number, or may be one.
[[nodiscard]] bool canBeNumber(const ExpressionType& type);

} // namespace velmora
