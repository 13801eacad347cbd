// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace velmora {

/// Strict UTF-8 as Unicode defines it: shortest form, no surrogates, nothing above U+10FFFF.

/// The character that begins at `offset`, which moves past it; none, and `offset` stays, where the bytes are
/// no character.
[[nodiscard]] std::optional<char32_t> nextCharacter(std::string_view text, std::size_t& offset);

/// The offset of the first byte that belongs to no character; absent where the text is all valid.
[[nodiscard]] std::optional<std::size_t> firstInvalidUTF8(std::string_view text);

/// Precondition: the character is a Unicode scalar value (at most U+10FFFF and no surrogate).
void appendUTF8(std::string& text, char32_t character);

[[nodiscard]] constexpr bool isUnicodeScalar(char32_t character) {
    return character <= 0x10FFFF && (character < 0xD800 || character > 0xDFFF);
}

} // namespace velmora
