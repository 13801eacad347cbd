// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/UTF8.h"

#include <cstddef>
#include <optional>
#include <string_view>

namespace velmora {

/// The characters that XML 1.0 allows in a document, for the reader and the writer of property lists.

[[nodiscard]] constexpr bool isXMLSpace(char character) {
    return character == ' ' || character == '\t' || character == '\n' || character == '\r';
}

/// Whether XML allows the character: no control character but tab, line feed and carriage return.
[[nodiscard]] constexpr bool isXMLCharacter(char32_t character) {
    if (character < 0x20)
        return character == '\t' || character == '\n' || character == '\r';
    return isUnicodeScalar(character) && character != 0xFFFE && character != 0xFFFF;
}

/// The offset of the first byte that starts no UTF-8 character, or one that XML does not allow; absent where
/// all of the text is allowed.
[[nodiscard]] inline std::optional<std::size_t> firstNotXML(std::string_view text) {
    std::size_t offset = 0;
    while (offset < text.size()) {
        // Nearly all of a list is ASCII; it needs no decoding.
        if (const auto byte = static_cast<unsigned char>(text[offset]);
            (byte >= 0x20 && byte < 0x80) || isXMLSpace(text[offset])) {
            ++offset;
            continue;
        }
        const std::size_t start = offset;
        const auto character = nextCharacter(text, offset);
        if (!character || !isXMLCharacter(*character))
            return start;
    }
    return std::nullopt;
}

} // namespace velmora
