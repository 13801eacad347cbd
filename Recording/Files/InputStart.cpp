// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/InputStart.h"

#include <algorithm>
#include <cstddef>

namespace velmora {

std::string unexpectedStart(Bytes begin, std::string_view wanted) {
    constexpr std::size_t shown = 12;
    std::string text = begin.empty() ? "empty" : "begins ";
    constexpr char digits[] = "0123456789ABCDEF";
    for (const std::uint8_t byte : begin.first(std::min(begin.size(), shown)))
        text += {digits[byte >> 4], digits[byte & 0xF], ' '};
    text += begin.empty() ? ", wanted " : "(hex), wanted ";
    text += wanted;
    return text;
}

} // namespace velmora
