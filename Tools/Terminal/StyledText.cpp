// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/StyledText.h"

#include "Platform/PrintableText.h"

namespace velmora {

std::size_t widthOf(const StyledLine& line) {
    std::size_t width = 0;
    for (const StyledSpan& span : line)
        width += displayWidth(span.text);
    return width;
}

StyledLine fitted(const StyledLine& line, std::size_t columns, Style padding) {
    StyledLine cut;
    std::size_t rest = columns;
    for (const StyledSpan& span : line) {
        const std::size_t width = displayWidth(span.text);
        if (width <= rest) {
            cut.push_back(span);
            rest -= width;
            continue;
        }
        std::string text = clipped(span.text, rest);
        rest -= displayWidth(text);
        cut.push_back({std::move(text), span.style});
        break;
    }
    if (rest > 0)
        cut.push_back({std::string(rest, ' '), padding});
    return cut;
}

StyledLine restyled(const StyledLine& line, Style style) {
    return {{plainText(line), style}};
}

std::string plainText(const StyledLine& line) {
    std::string text;
    for (const StyledSpan& span : line)
        text += span.text;
    return text;
}

} // namespace velmora
