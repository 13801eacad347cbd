// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/PrintableText.h"

#include "Platform/UTF8.h"

#include <cstdio>
#include <optional>

#include <utf8proc.h>

namespace velmora {

namespace {

std::size_t widthOf(char32_t character) {
    return static_cast<std::size_t>(utf8proc_charwidth(static_cast<utf8proc_int32_t>(character)));
}

bool isControl(char32_t character) {
    // The last are the marks that turn the writing direction, and the separators that end a line.
    return character < 0x20 || (character >= 0x7F && character < 0xA0) ||
           (character >= 0x2028 && character <= 0x202E) || (character >= 0x2066 && character <= 0x2069);
}

void appendEscape(std::string& out, char32_t character) {
    switch (character) {
    case '\n': out += "\\n"; return;
    case '\t': out += "\\t"; return;
    case '\r': out += "\\r"; return;
    default: break;
    }
    char text[16];
    std::snprintf(text, sizeof text, character < 0x80 ? "\\x%02X" : "\\u{%X}",
                  static_cast<unsigned>(character));
    out += text;
}

} // namespace

std::string printable(std::string_view text) {
    std::string out;
    out.reserve(text.size());
    for (std::size_t offset = 0; offset < text.size();) {
        const std::optional<char32_t> character = nextCharacter(text, offset);
        if (!character) {
            ++offset;
            appendUTF8(out, 0xFFFD);
        } else if (isControl(*character)) {
            appendEscape(out, *character);
        } else {
            appendUTF8(out, *character);
        }
    }
    return out;
}

std::size_t displayWidth(std::string_view text) {
    std::size_t width = 0;
    for (std::size_t offset = 0; offset < text.size();) {
        const std::optional<char32_t> character = nextCharacter(text, offset);
        if (!character)
            ++offset;
        width += character ? widthOf(*character) : 1;
    }
    return width;
}

std::string clipped(std::string_view text, std::size_t columns) {
    if (displayWidth(text) <= columns)
        return std::string(text);
    if (columns == 0)
        return {};
    std::size_t width = 0;
    std::size_t kept = 0;
    for (std::size_t offset = 0; offset < text.size(); kept = offset) {
        const std::optional<char32_t> character = nextCharacter(text, offset);
        if (!character)
            ++offset;
        width += character ? widthOf(*character) : 1;
        if (width > columns - 1)
            break;
    }
    return std::string(text.substr(0, kept)) + "…";
}

} // namespace velmora
