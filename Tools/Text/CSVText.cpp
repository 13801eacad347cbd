// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/CSVText.h"

#include "Platform/UTF8.h"
#include "Tools/Text/JSONText.h"

#include <algorithm>

namespace velmora {

namespace {

/// Characters that are written unchanged, inside and outside quotes.
bool isPlain(char character) {
    const auto byte = static_cast<unsigned char>(character);
    return byte >= 0x20 && byte < 0x7F && byte != '"' && byte != ',';
}

void appendQuoted(TextBuffer& out, std::string_view text) {
    constexpr std::string_view replacementCharacter = "\xEF\xBF\xBD"; // U+FFFD
    out.append('"');
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

void appendCsvText(TextBuffer& out, std::string_view text) {
    if (!text.empty() && std::all_of(text.begin(), text.end(), isPlain))
        out.append(text);
    else
        appendQuoted(out, text);
}

void appendCsvCell(TextBuffer& out, const Value* value) {
    if (!value || value->isNone())
        return;
    if (const std::string* text = value->asString()) {
        appendCsvText(out, *text);
        return;
    }
    TextBuffer json;
    appendJson(json, *value);
    appendCsvText(out, json.view());
}

} // namespace velmora
