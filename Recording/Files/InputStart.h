// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <string>
#include <string_view>

namespace velmora {

/// Why an input is not the expected one, by its first bytes: "empty, wanted a pcapng section header", "begins
/// D4 C3 B2 A1 (hex), wanted ...". `begin` is the part that could be read; its first 12 bytes are shown.
[[nodiscard]] std::string unexpectedStart(Bytes begin, std::string_view wanted);

} // namespace velmora
