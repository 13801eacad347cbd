// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// What a piece of text on a screen is; the painter chooses how it looks. No style is the only sign of
/// anything: without colours and for screen readers the text alone says the same.
enum class Style : std::uint8_t {
    Plain,
    Heading,
    Bar,    ///< a line across the screen
    Chosen, ///< the row that keys act on
    Changed,
    Dim, ///< old, or of less interest
    Warning,
};

struct StyledSpan {
    std::string text; ///< printable
    Style style = Style::Plain;

    friend bool operator==(const StyledSpan&, const StyledSpan&) = default;
};

using StyledLine = std::vector<StyledSpan>;

/// The columns that a line takes.
[[nodiscard]] std::size_t widthOf(const StyledLine& line);
/// The line in exactly that many columns: cut, or padded with blanks of the style.
[[nodiscard]] StyledLine fitted(const StyledLine& line, std::size_t columns, Style padding = Style::Plain);
/// The same text in one style.
[[nodiscard]] StyledLine restyled(const StyledLine& line, Style style);
[[nodiscard]] std::string plainText(const StyledLine& line);

} // namespace velmora
