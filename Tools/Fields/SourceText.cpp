// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Fields/SourceText.h"

#include <charconv>
#include <cstdio>

namespace velmora {

namespace {

std::string others(const EnumTexts& texts) {
    std::string text(texts.before);
    if (texts.showsOthers) {
        text += '*';
        text += texts.after;
    }
    return text;
}

} // namespace

std::string codeText(std::uint32_t code) {
    char text[16];
    std::snprintf(text, sizeof text, "0x%04X", static_cast<unsigned>(code));
    return text;
}

std::string numberText(double number) {
    char text[32];
    return {text, std::to_chars(text, text + sizeof text, number).ptr};
}

std::string enumerationText(const Field& field) {
    const TextFormat& format = field.format;
    if (format.kind == TextFormat::Kind::Flag)
        return "0=" + std::string(format.clear) + "|*=" + std::string(format.set);
    if (format.kind != TextFormat::Kind::Enumeration)
        return {};
    std::string text;
    for (const EnumText& row : format.texts->rows)
        text += std::to_string(row.value) + "=" + std::string(row.text) + "|";
    return text + "*=" + others(*format.texts);
}

} // namespace velmora
