// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"

#include <array>
#include <cstdint>
#include <string>
#include <string_view>

namespace velmora {

/// The secret on which pseudonyms depend: the holder of a key can tell which value a pseudonym stands for by
/// trying them all.
struct MaskKey {
    static constexpr std::size_t length = 32;
    std::array<std::uint8_t, length> bytes{};

    /// From the system's random numbers.
    static Result<MaskKey> random();
    /// As a key file holds it: 64 hexadecimal digits, and white space after them.
    static Result<MaskKey> read(std::string_view text);
    [[nodiscard]] std::string text() const;
    /// Names the key without disclosing it: 32 hexadecimal digits.
    [[nodiscard]] std::string fingerprint() const;
};

/// Two digits a byte, in lower case.
[[nodiscard]] std::string hexadecimalText(Bytes bytes);

} // namespace velmora
