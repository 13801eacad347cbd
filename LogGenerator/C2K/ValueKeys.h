// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/LogCodeParser.h"

#include <string_view>
#include <vector>

namespace velmora::C2K {

/// The value keys under which the parser may publish values, some perhaps twice.
[[nodiscard]] std::vector<std::string_view> valueKeysOf(const LogCodeParser& parser);

} // namespace velmora::C2K
