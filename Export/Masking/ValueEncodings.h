// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <string_view>
#include <vector>

namespace velmora {

/// How a value may stand in a file.
enum class ValueEncoding : std::uint8_t {
    Text, ///< ASCII or UTF-8
    UTF16Little,
    UTF16Big,
    BCD,         ///< two digits a byte, the first in the upper half; from any half byte on
    SwappedBCD,  ///< the first in the lower half (3GPP TS 24.008 10.5.4.7)
    SwappedText, ///< swapped BCD as hexadecimal digits
    Hexadecimal, ///< of the text's bytes
    Base64,      ///< of any of the forms above, wherever in the encoded bytes it begins
};

[[nodiscard]] std::string_view nameOf(ValueEncoding encoding);

/// Bytes that show that a value is there. Where an encoding mixes the value with what is before and after it,
/// they are those in between.
struct EncodedValue {
    ValueEncoding encoding;
    std::vector<std::uint8_t> bytes;
};

/// Encodings of fewer bytes would be found in anything.
inline constexpr std::size_t shortestEncoding = 4;

/// The value in all encodings that are long enough. It has digits as written, but for spaces, hyphens and a
/// plus sign between and before them, which are left out.
[[nodiscard]] std::vector<EncodedValue> encodingsOf(std::string_view value);

} // namespace velmora
