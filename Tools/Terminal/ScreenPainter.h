// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Terminal/StyledText.h"

#include <cstddef>
#include <string>
#include <vector>

namespace velmora {

/// Whether colours may be used: not where NO_COLOR is set to anything, as https://no-color.org has it, and
/// not on a terminal of type "dumb".
enum class Colours : bool { None, Some };
[[nodiscard]] Colours coloursOfEnvironment();

/// The bytes that draw the lines from the top on, without clearing any part in between. The lines fill the
/// screen's rows, and each is exactly as wide as the screen.
[[nodiscard]] std::string paintedScreen(const std::vector<StyledLine>& lines, Colours colours);

} // namespace velmora
