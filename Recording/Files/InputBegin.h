// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <string>
#include <string_view>

namespace velmora {

/// Why an input is not what was wanted, by what it begins with: "empty, wanted a pcapng section header",
/// "begins D4 C3 B2 A1 (hex), wanted ...". `begin` is what could be read of it; its first 12 bytes are shown.
[[nodiscard]] std::string unexpectedBegin(Bytes begin, std::string_view wanted);

} // namespace velmora
