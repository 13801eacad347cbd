// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/PrintableText.h"

#include "Platform/UTF8.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <iterator>
#include <optional>

namespace velmora {

namespace {

struct Range {
    char32_t first;
    char32_t last;
};

// The blocks that matter on a screen of names and numbers, not all of Unicode: marks that sit on the
// character before them, and characters as wide as two.
constexpr std::array<Range, 11> zeroWidth = {{{0x0300, 0x036F},
                                              {0x0483, 0x0489},
                                              {0x0591, 0x05BD},
                                              {0x064B, 0x065F},
                                              {0x1AB0, 0x1AFF},
                                              {0x1DC0, 0x1DFF},
                                              {0x200B, 0x200F},
                                              {0x20D0, 0x20FF},
                                              {0xFE00, 0xFE0F},
                                              {0xFE20, 0xFE2F},
                                              {0xFEFF, 0xFEFF}}};
constexpr std::array<Range, 10> doubleWidth = {{{0x1100, 0x115F},
                                                {0x2E80, 0x303E},
                                                {0x3041, 0x33FF},
                                                {0x3400, 0x4DBF},
                                                {0x4E00, 0x9FFF},
                                                {0xAC00, 0xD7A3},
                                                {0xF900, 0xFAFF},
                                                {0xFF00, 0xFF60},
                                                {0x1F300, 0x1FAFF},
                                                {0x20000, 0x3FFFD}}};

template <std::size_t size>
bool isIn(const std::array<Range, size>& ranges, char32_t character) {
    return std::any_of(ranges.begin(), ranges.end(), [character](const Range& range) {
        return character >= range.first && character <= range.last;
    });
}

std::size_t widthOf(char32_t character) {
    if (isIn(zeroWidth, character))
        return 0;
    return isIn(doubleWidth, character) ? 2 : 1;
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
