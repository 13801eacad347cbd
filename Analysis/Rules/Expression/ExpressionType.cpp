// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Expression/ExpressionType.h"

namespace velmora {

std::string describe(const ExpressionType& type) {
    switch (type.kind) {
    case ExpressionType::Kind::Truth: return "a condition";
    case ExpressionType::Kind::Text: return "a text";
    case ExpressionType::Kind::Enumeration: return "an enumeration";
    case ExpressionType::Kind::Any: return "a number or a text";
    case ExpressionType::Kind::Number: break;
    }
    if (type.unit == Unit::None)
        return type.isPlain ? "a plain number" : "a number without a unit";
    return "a number in " + std::string(nameOf(type.unit));
}

} // namespace velmora
