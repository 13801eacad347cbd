// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Screen/Characters.h"

#include "Platform/PrintableText.h"
#include "Platform/UTF8.h"

#include <cstdlib>

namespace velmora {

namespace {

std::string asciiText(std::string_view text) {
    std::string ascii;
    for (std::size_t at = 0; at < text.size();) {
        const std::size_t begin = at;
        const std::optional<char32_t> character = nextCharacter(text, at);
        if (!character) {
            ++at;
            ascii += '?';
        } else if (*character < 0x80) {
            ascii += static_cast<char>(*character);
        } else {
            ascii.append(displayWidth(text.substr(begin, at - begin)), *character == U'…' ? '~' : '?');
        }
    }
    return ascii;
}

} // namespace

Characters charactersOfEnvironment() {
    for (const char* const name : {"LC_ALL", "LC_CTYPE", "LANG"}) {
        const char* const value = std::getenv(name);
        if (!value || *value == '\0')
            continue;
        std::string locale(value);
        for (char& each : locale)
            if (each >= 'A' && each <= 'Z')
                each = static_cast<char>(each - 'A' + 'a');
        const bool isUTF8 = locale.find("utf-8") != locale.npos || locale.find("utf8") != locale.npos;
        return isUTF8 ? Characters::Unicode : Characters::ASCII;
    }
    return Characters::ASCII;
}

StyledLine asciiOnly(const StyledLine& line) {
    StyledLine ascii;
    for (const StyledSpan& span : line)
        ascii.push_back({asciiText(span.text), span.style});
    return ascii;
}

} // namespace velmora
