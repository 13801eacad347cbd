// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Terminal/StyledText.h"

#include <cstdint>
#include <string>
#include <string_view>

namespace velmora {

/// Which characters the terminal shows: all of Unicode, or ASCII alone.
enum class Characters : std::uint8_t { Unicode, ASCII };

/// By the locale that the environment names: LC_ALL, LC_CTYPE or LANG, the first that is set, as POSIX has
/// it. What names no UTF-8 gets ASCII.
[[nodiscard]] Characters charactersOfEnvironment();

/// The line with nothing but ASCII, as wide as before: a question mark for each column of another character.
[[nodiscard]] StyledLine asciiOnly(const StyledLine& line);

} // namespace velmora
