// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/PrintableText.h"

#include "Platform/UTF8.h"

#include <algorithm>
#include <cstdio>
#include <optional>

#include <utf8proc.h>

namespace velmora {

namespace {

std::size_t widthOf(char32_t character) {
    return static_cast<std::size_t>(utf8proc_charwidth(static_cast<utf8proc_int32_t>(character)));
}

/// As many as any script needs on one letter. More of them are drawn over the lines above and below.
constexpr std::size_t maximumMarks = 8;

/// Letters without a glyph and without a width that anything agrees on.
bool isFiller(char32_t character) {
    return character == 0x115F || character == 0x1160 || character == 0x3164 || character == 0xFFA0;
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

CharacterKind kindOf(char32_t character) {
    if (character >= 0x20 && character < 0x7F)
        return CharacterKind::Shown;
    switch (utf8proc_category(static_cast<utf8proc_int32_t>(character))) {
    case UTF8PROC_CATEGORY_CC:
    case UTF8PROC_CATEGORY_CF: // among them the marks that turn the writing direction, and tags
    case UTF8PROC_CATEGORY_ZL:
    case UTF8PROC_CATEGORY_ZP: return CharacterKind::Control;
    case UTF8PROC_CATEGORY_CN:
    case UTF8PROC_CATEGORY_CS: return CharacterKind::Hidden;
    case UTF8PROC_CATEGORY_MN:
    case UTF8PROC_CATEGORY_MC:
    case UTF8PROC_CATEGORY_ME: return CharacterKind::Mark;
    default: return isFiller(character) ? CharacterKind::Hidden : CharacterKind::Shown;
    }
}

bool isPlain(std::string_view text) {
    return std::all_of(text.begin(), text.end(), [](char character) {
        const auto byte = static_cast<unsigned char>(character);
        return byte >= 0x20 && byte < 0x7F;
    });
}

std::string printable(std::string_view text) {
    if (isPlain(text))
        return std::string(text);
    std::string out;
    out.reserve(text.size());
    std::size_t marks = maximumMarks; // the first character may not combine with what is printed before
    for (std::size_t offset = 0; offset < text.size();) {
        const std::optional<char32_t> character = nextCharacter(text, offset);
        if (!character) {
            ++offset;
            appendUTF8(out, 0xFFFD);
            marks = maximumMarks;
            continue;
        }
        const CharacterKind kind = kindOf(*character);
        const bool isEscaped = kind == CharacterKind::Control || kind == CharacterKind::Hidden;
        if (isEscaped || (kind == CharacterKind::Mark && marks == maximumMarks)) {
            appendEscape(out, *character);
            marks = maximumMarks;
        } else {
            appendUTF8(out, *character);
            marks = kind == CharacterKind::Mark ? marks + 1 : 0;
        }
    }
    return out;
}

std::string printableLine(std::string_view text) {
    if (text.ends_with('\n'))
        text.remove_suffix(1);
    if (text.find('\n') == text.npos)
        return printable(text);
    std::string line(text);
    std::replace(line.begin(), line.end(), '\n', ' ');
    return printable(line);
}

std::string printableLines(std::string_view text) {
    std::string lines;
    for (std::size_t end = 0; (end = text.find('\n')) != text.npos; text.remove_prefix(end + 1))
        lines += printable(text.substr(0, end)) + '\n';
    return lines + printable(text);
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
