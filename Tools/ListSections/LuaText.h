// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

/// The text as a string of Lua 5.2.
[[nodiscard]] std::string luaString(std::string_view text);

/// The number with as many digits as read back as it.
[[nodiscard]] std::string luaNumber(double number);

} // namespace velmora
