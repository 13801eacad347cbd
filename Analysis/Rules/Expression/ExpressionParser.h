// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/Expression/Expression.h"
#include "Analysis/Rules/Expression/InputNames.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <variant>

namespace velmora {

/// A mistake in an expression: what was found and what was expected.
struct ExpressionError {
    std::size_t position; ///< in bytes of its text
    std::string text;
};

/// Reads an expression and checks the types of its operands. Bounded in length and depth.
[[nodiscard]] std::variant<Expression, ExpressionError> parseExpression(std::string_view text,
                                                                        const InputNames& names);

} // namespace velmora
