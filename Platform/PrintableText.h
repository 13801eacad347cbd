// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <string>
#include <string_view>

namespace velmora {

/// Text that is safe to print: a recording's content must not be able to control the terminal. Line feeds,
/// tabs and carriage returns become "\n", "\t", "\r", other control characters "\xNN" or "\u{NN}", and a byte
/// that is no UTF-8 becomes U+FFFD. Text without any of these is unchanged.
[[nodiscard]] std::string printable(std::string_view text);

/// The terminal columns that printable text takes, as Unicode has them: none for combining marks, two for
/// East Asian wide characters and emoji, otherwise one a character.
[[nodiscard]] std::size_t displayWidth(std::string_view text);

/// The longest prefix of printable text that fits into `columns`; a truncated one ends in "…".
[[nodiscard]] std::string clipped(std::string_view text, std::size_t columns);

} // namespace velmora
