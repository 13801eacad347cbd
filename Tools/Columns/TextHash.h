// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <string_view>

namespace velmora {

/// 32 hexadecimal digits of XXH3.
[[nodiscard]] std::string textHash(std::string_view text);

} // namespace velmora
