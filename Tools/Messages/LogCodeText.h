// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <cstdint>
#include <string_view>

namespace velmora {

/// Reads a log code as users give it: hexadecimal as `velmora-log info` lists it ("0x512C", "0xFF0000"), or
/// decimal as JSON has it ("20780"). It is 16 bits, or 0xFF0000 and 16 bits for the extra stream.
[[nodiscard]] Result<std::uint32_t> readLogCode(std::string_view text);

} // namespace velmora
