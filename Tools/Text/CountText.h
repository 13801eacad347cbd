// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string>

namespace velmora {

/// A count in decimal digits, with a comma after each thousand: "1,291".
[[nodiscard]] std::string countText(std::uint64_t count);

} // namespace velmora
