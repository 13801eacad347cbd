// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Terminal/ScreenPainter.h"

#include <cstdlib>
#include <string_view>

namespace velmora {

namespace {

std::string_view sequenceOf(Style style, Colours colours) {
    const bool hasColours = colours == Colours::Some;
    switch (style) {
    case Style::Plain: return "\x1b[0m";
    case Style::Heading: return "\x1b[0;1m";
    case Style::Bar: return "\x1b[0;7m";
    case Style::Chosen: return "\x1b[0;7m";
    case Style::Changed: return hasColours ? "\x1b[0;1;33m" : "\x1b[0;1m";
    case Style::Dim: return "\x1b[0;2m";
    case Style::Warning: return hasColours ? "\x1b[0;31m" : "\x1b[0;4m";
    }
    return {};
}

} // namespace

Colours coloursOfEnvironment() {
    const char* const none = std::getenv("NO_COLOR");
    const char* const terminal = std::getenv("TERM");
    const bool isDumb = terminal && std::string_view(terminal) == "dumb";
    return (none && *none != '\0') || isDumb ? Colours::None : Colours::Some;
}

std::string paintedScreen(const std::vector<StyledLine>& lines, Colours colours) {
    std::string bytes = "\x1b[H";
    for (const StyledLine& line : lines) {
        if (&line != &lines.front())
            bytes += "\r\n";
        Style current = Style::Plain;
        for (const StyledSpan& span : line) {
            if (span.style != current)
                bytes += sequenceOf(span.style, colours);
            current = span.style;
            bytes += span.text;
        }
        if (current != Style::Plain)
            bytes += sequenceOf(Style::Plain, colours);
    }
    return bytes;
}

} // namespace velmora
