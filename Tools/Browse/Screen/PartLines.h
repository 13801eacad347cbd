// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/Screen/BrowseView.h"
#include "Tools/Terminal/StyledText.h"

#include <cstddef>
#include <vector>

namespace velmora {

/// The lines of the parts of a screen, as many as `rows`; the screen cuts them to their width. What is chosen
/// begins with ">", so that it is seen without reverse colours.

[[nodiscard]] std::vector<StyledLine> listLines(const BrowseView& view, std::size_t rows);
/// What the message has changed is marked with "*", what it reported unchanged with "=".
[[nodiscard]] std::vector<StyledLine> displayLines(const BrowseView& view, std::size_t rows,
                                                   std::size_t columns);
/// The bytes of the highlighted field are in brackets, the chosen byte in angle brackets.
[[nodiscard]] std::vector<StyledLine> byteLines(const BrowseView& view, std::size_t rows,
                                                std::size_t perLine);
[[nodiscard]] std::vector<StyledLine> eventLines(const BrowseView& view, std::size_t rows,
                                                 std::size_t columns);

} // namespace velmora
