// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/Screen/BrowseView.h"
#include "Tools/Browse/Screen/Characters.h"
#include "Tools/Terminal/StyledText.h"

#include <cstddef>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Levels as a row of characters, two a column in braille, whose dots stand for a quarter of the range each,
/// one a column in ASCII, " .:-=+*#" from the lowest on. Nothing measured shows a blank.
[[nodiscard]] std::string levelRow(const std::vector<std::optional<double>>& levels, std::size_t columns,
                                   Characters characters);

/// The strip's two lines: levels, and below them what lies where in the drive: "^" the chosen message, "!"
/// events that are more than information.
[[nodiscard]] std::vector<StyledLine> stripLines(const BrowseView& view, std::size_t columns,
                                                 Characters characters);

} // namespace velmora
