// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cmath>
#include <string_view>

namespace velmora {

/// The value of an expression: a number, a text, both (an enumeration), a condition (1 or 0), or unknown.
struct RuleValue {
    double number = 0;
    std::string_view text{}; ///< valid as long as the inputs are not changed
    bool hasNumber = false;
    bool hasText = false;

    [[nodiscard]] static RuleValue unknown() { return {}; }
    /// Unknown for what is no finite number, such as a quotient by 0.
    [[nodiscard]] static RuleValue of(double number) {
        return std::isfinite(number) ? RuleValue{number, {}, true, false} : RuleValue();
    }
    [[nodiscard]] static RuleValue of(std::string_view text) { return {0, text, false, true}; }
    [[nodiscard]] static RuleValue truth(bool holds) { return {holds ? 1.0 : 0.0, {}, true, false}; }

    [[nodiscard]] bool isKnown() const { return hasNumber || hasText; }
    [[nodiscard]] bool isTrue() const { return hasNumber && number != 0; }
    [[nodiscard]] bool isFalse() const { return hasNumber && number == 0; }
};

} // namespace velmora
