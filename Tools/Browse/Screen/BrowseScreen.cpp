// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Screen/BrowseScreen.h"

#include "Platform/PrintableText.h"
#include "Tools/Browse/Screen/BrowseLayout.h"
#include "Tools/Browse/Screen/LevelStrip.h"
#include "Tools/Browse/Screen/PartLines.h"

#include <algorithm>

namespace velmora {

namespace {

/// Two texts in one bar, of which the left one is cut.
StyledLine barLine(const std::string& left, const std::string& right, std::size_t columns) {
    const std::size_t width = displayWidth(right);
    if (width + 2 > columns)
        return fitted({{left, Style::Bar}}, columns, Style::Bar);
    StyledLine line = fitted({{left, Style::Bar}}, columns - width, Style::Bar);
    line.push_back({right, Style::Bar});
    return line;
}

void append(StyledLine& line, const StyledLine& more) {
    line.insert(line.end(), more.begin(), more.end());
}

/// The headings of the parts below the list, the one that keys act on in brackets.
StyledLine headings(const BrowseView& view, const BrowseLayout& layout) {
    const auto heading = [&view](BrowsePart part, const std::string& name) -> StyledLine {
        return view.part == part ? StyledLine{{"[" + name + "]", Style::Heading}}
                                 : StyledLine{{" " + name + " ", Style::Heading}};
    };
    StyledLine line = fitted(heading(BrowsePart::Display, "Display"), layout.displayColumns + 1);
    const bool showsEvents = layout.eventsColumns == 0 && view.part == BrowsePart::Events;
    append(line,
           fitted(showsEvents ? heading(BrowsePart::Events, "Events") : heading(BrowsePart::Content, "Bytes"),
                  layout.bytesColumns + (layout.eventsColumns > 0 ? 1 : 0)));
    if (layout.eventsColumns > 0)
        append(line, fitted(heading(BrowsePart::Events, "Events"), layout.eventsColumns));
    return line;
}

void appendLowerParts(std::vector<StyledLine>& lines, const BrowseView& view, const BrowseLayout& layout) {
    lines.push_back(headings(view, layout));
    const std::size_t rows = layout.lowerRows;
    const std::vector<StyledLine> display = displayLines(view, rows, layout.displayColumns);
    const bool showsEvents = layout.eventsColumns == 0 && view.part == BrowsePart::Events;
    const std::vector<StyledLine> middle = showsEvents ? eventLines(view, rows, layout.bytesColumns)
                                                       : byteLines(view, rows, layout.bytesPerLine);
    const std::vector<StyledLine> right =
        layout.eventsColumns > 0 ? eventLines(view, rows, layout.eventsColumns) : std::vector<StyledLine>();
    for (std::size_t i = 0; i < rows; ++i) {
        StyledLine line = fitted(display[i], layout.displayColumns);
        line.push_back({" "});
        append(line, fitted(middle[i], layout.bytesColumns));
        if (layout.eventsColumns > 0) {
            line.push_back({" "});
            append(line, fitted(right[i], layout.eventsColumns));
        }
        lines.push_back(std::move(line));
    }
}

} // namespace

std::vector<StyledLine> browseScreen(const BrowseView& view, ScreenSize size, Characters characters) {
    const BrowseLayout layout = BrowseLayout::of(size);
    std::vector<StyledLine> lines;
    lines.push_back(barLine(view.title, view.place, size.columns));
    if (!view.help.empty()) {
        for (const std::string& each : view.help)
            lines.push_back({{each}});
    } else {
        for (StyledLine& line : listLines(view, layout.listRows))
            lines.push_back(std::move(line));
        if (layout.lowerRows > 0)
            appendLowerParts(lines, view, layout);
        if (layout.stripRows > 0)
            for (StyledLine& line : stripLines(view, size.columns, characters))
                lines.push_back(std::move(line));
    }
    lines.resize(size.rows > 0 ? size.rows - 1 : 0);
    if (size.rows > 0)
        lines.push_back({{view.status, view.isPrompt ? Style::Plain : Style::Bar}});
    for (StyledLine& line : lines) {
        if (characters == Characters::ASCII)
            line = asciiOnly(line);
        const Style padding = line.empty() || line.back().style != Style::Bar ? Style::Plain : Style::Bar;
        line = fitted(line, size.columns, padding);
        if (characters == Characters::ASCII)
            line = asciiOnly(line); // what was cut ends in an ellipsis
    }
    return lines;
}

} // namespace velmora
