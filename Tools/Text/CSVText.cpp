// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/CSVText.h"

#include "Platform/UTF8.h"
#include "Tools/Text/JSONText.h"

#include <algorithm>
#include <charconv>
#include <system_error>

namespace velmora {

namespace {

/// Characters that are written unchanged, inside and outside quotes.
bool isPlain(char character) {
    const auto byte = static_cast<unsigned char>(character);
    return byte >= 0x20 && byte < 0x7F && byte != '"' && byte != ',';
}

/// A decimal number, with or without sign and exponent, and nothing else.
bool isNumber(std::string_view text) {
    if (text.starts_with('+') || text.starts_with('-'))
        text.remove_prefix(1);
    if (text.empty() || !((text[0] >= '0' && text[0] <= '9') || text[0] == '.'))
        return false; // a second sign, or a word such as "inf"
    double number = 0;
    const char* const end = text.data() + text.size();
    const auto [parsed, error] = std::from_chars(text.data(), end, number);
    return parsed == end && error != std::errc::invalid_argument;
}

bool isFormula(std::string_view text) {
    constexpr std::string_view beginnings = "=+-@\t\r\n";
    return !text.empty() && beginnings.find(text[0]) != beginnings.npos && !isNumber(text);
}

void appendQuoted(TextBuffer& out, std::string_view text, std::string_view before) {
    constexpr std::string_view replacementCharacter = "\xEF\xBF\xBD"; // U+FFFD
    out.append('"');
    out.append(before);
    for (std::size_t offset = 0; offset < text.size();) {
        const std::size_t begin = offset;
        if (text[offset] == '"') {
            out.append("\"\"");
            ++offset;
        } else if (text[offset] != '\0' && nextCharacter(text, offset)) {
            out.append(text.substr(begin, offset - begin));
        } else {
            ++offset;
            out.append(replacementCharacter);
        }
    }
    out.append('"');
}

} // namespace

void appendCsvText(TextBuffer& out, std::string_view text, CSVGuard guard) {
    const std::string_view before = guard == CSVGuard::On && isFormula(text) ? "'" : "";
    if (!text.empty() && std::all_of(text.begin(), text.end(), isPlain)) {
        out.append(before);
        out.append(text);
    } else {
        appendQuoted(out, text, before);
    }
}

void appendCsvCell(TextBuffer& out, const Value* value, CSVGuard guard) {
    if (!value || value->isNone())
        return;
    if (const std::string* text = value->asString()) {
        appendCsvText(out, *text, guard);
        return;
    }
    TextBuffer json;
    appendJson(json, *value);
    appendCsvText(out, json.view(), guard);
}

} // namespace velmora
