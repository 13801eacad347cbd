// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Unit.h"

#include <cstdint>
#include <string>

namespace velmora {

/// What the value of an expression is.
struct ExpressionType {
    enum class Kind : std::uint8_t {
        Truth,
        Number,
        Text,
        Enumeration, ///< compared by its text, or by its raw number
        Any, ///< a number or a text: which differs between technologies, or is known from messages alone
    };

    Kind kind = Kind::Truth;
    Unit unit = Unit::None;
    /// A number that was written without a unit: it takes that of what it is compared with or added to.
    bool isPlain = false;

    friend bool operator==(const ExpressionType&, const ExpressionType&) = default;
};

inline constexpr ExpressionType truthType{};
inline constexpr ExpressionType textType{ExpressionType::Kind::Text};

[[nodiscard]] constexpr ExpressionType numberType(Unit unit, bool isPlain = false) {
    return {ExpressionType::Kind::Number, unit, isPlain};
}

/// "a number in dBm", "a number without a unit", "a text": for messages.
[[nodiscard]] std::string describe(const ExpressionType& type);

} // namespace velmora
