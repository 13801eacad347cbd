// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Expression/ExpressionParser.h"

#include "Analysis/Rules/Expression/ExpressionReader.h"

namespace velmora {

std::variant<Expression, ExpressionError> parseExpression(std::string_view text, const InputNames& names) {
    if (text.size() > Expression::mostBytes)
        return ExpressionError{0, "got an expression of " + std::to_string(text.size()) +
                                      " bytes, wanted at most " + std::to_string(Expression::mostBytes)};
    try {
        return ExpressionReader(text, names).read();
    } catch (const ExpressionMistake& mistake) {
        return ExpressionError{mistake.position(), mistake.what()};
    }
}

} // namespace velmora
