// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>

namespace velmora {

/// A mistake in a rule file.
struct RuleError {
    std::string file;
    std::uint32_t line = 0;   ///< from 1; 0 for the file as a whole
    std::uint32_t column = 0; ///< from 1, in characters; 0 where line is
    std::string text;         ///< what was found and what was expected, lower-case prose without a full stop

    /// "coverage.toml:3:8: " and the text.
    [[nodiscard]] std::string message() const;
};

} // namespace velmora
