// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/ValidText.h"

#include "Platform/UTF8.h"

#include <optional>

namespace velmora {

namespace {

bool isASCII(std::string_view text) {
    unsigned char all = 0;
    for (const char c : text)
        all |= static_cast<unsigned char>(c);
    return all < 0x80;
}

} // namespace

std::string_view validText(std::string_view text, std::string& storage) {
    std::optional<std::size_t> invalid = isASCII(text) ? std::nullopt : firstInvalidUTF8(text);
    if (!invalid)
        return text;
    storage.clear();
    while (invalid) {
        storage.append(text.substr(0, *invalid)).append("\xEF\xBF\xBD");
        text.remove_prefix(*invalid + 1);
        invalid = firstInvalidUTF8(text);
    }
    return storage.append(text);
}

} // namespace velmora
