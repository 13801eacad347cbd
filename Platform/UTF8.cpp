// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/UTF8.h"

namespace velmora {

std::optional<char32_t> nextCharacter(std::string_view text, std::size_t& offset) {
    if (offset >= text.size())
        return std::nullopt;
    const auto byteAt = [text](std::size_t index) -> char32_t {
        return static_cast<unsigned char>(text[index]);
    };
    const char32_t lead = byteAt(offset);
    if (lead < 0x80) {
        ++offset;
        return lead;
    }

    std::size_t length = 0;
    char32_t character = 0;
    char32_t smallest = 0;
    if ((lead & 0xE0) == 0xC0) {
        length = 2;
        character = lead & 0x1F;
        smallest = 0x80;
    } else if ((lead & 0xF0) == 0xE0) {
        length = 3;
        character = lead & 0x0F;
        smallest = 0x800;
    } else if ((lead & 0xF8) == 0xF0) {
        length = 4;
        character = lead & 0x07;
        smallest = 0x10000;
    } else {
        return std::nullopt;
    }
    if (text.size() - offset < length)
        return std::nullopt;
    for (std::size_t i = 1; i < length; ++i) {
        const char32_t next = byteAt(offset + i);
        if ((next & 0xC0) != 0x80)
            return std::nullopt;
        character = character << 6 | (next & 0x3F);
    }
    if (character < smallest || !isUnicodeScalar(character))
        return std::nullopt;
    offset += length;
    return character;
}

std::optional<std::size_t> firstInvalidUTF8(std::string_view text) {
    std::size_t offset = 0;
    while (offset < text.size()) {
        // Nearly all text is ASCII; it needs no decoding.
        if (static_cast<unsigned char>(text[offset]) < 0x80)
            ++offset;
        else if (!nextCharacter(text, offset))
            return offset;
    }
    return std::nullopt;
}

void appendUTF8(std::string& text, char32_t character) {
    if (character < 0x80) {
        text += static_cast<char>(character);
    } else if (character < 0x800) {
        text += static_cast<char>(0xC0 | character >> 6);
        text += static_cast<char>(0x80 | (character & 0x3F));
    } else if (character < 0x10000) {
        text += static_cast<char>(0xE0 | character >> 12);
        text += static_cast<char>(0x80 | (character >> 6 & 0x3F));
        text += static_cast<char>(0x80 | (character & 0x3F));
    } else {
        text += static_cast<char>(0xF0 | character >> 18);
        text += static_cast<char>(0x80 | (character >> 12 & 0x3F));
        text += static_cast<char>(0x80 | (character >> 6 & 0x3F));
        text += static_cast<char>(0x80 | (character & 0x3F));
    }
}

} // namespace velmora
