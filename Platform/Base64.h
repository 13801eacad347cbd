// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

/// Base64 as RFC 4648 (clause 4) defines it, padded to a multiple of four digits.

[[nodiscard]] constexpr std::size_t base64Size(std::size_t bytes) {
    return (bytes + 2) / 3 * 4;
}

/// Writes the bytes' base64, base64Size() characters.
void putBase64(char* text, Bytes bytes);

/// Decodes base64 text, ignoring spaces, tabs and line ends; absent for any other text.
[[nodiscard]] std::optional<std::vector<std::uint8_t>> bytesOfBase64(std::string_view text);

} // namespace velmora
