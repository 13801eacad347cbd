// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Screen/PartLines.h"

#include "Platform/PrintableText.h"
#include "Tools/Browse/Screen/RowText.h"

#include <algorithm>
#include <cstdio>
#include <string>

namespace velmora {

namespace {

std::string hex(std::size_t number, int digits) {
    char text[24];
    std::snprintf(text, sizeof text, "%0*zx", digits, number);
    return text;
}

Style styleOf(const DisplayRow& row) {
    if (row.isBranch)
        return Style::Heading;
    if (row.hasChanged)
        return Style::Changed;
    return row.isOld ? Style::Dim : Style::Plain;
}

/// A byte with what is before it: a blank, or a bracket where something begins or ends.
StyledLine byteSpans(const BrowseView& view, std::size_t offset, bool isFirst) {
    const auto inField = [&view](std::size_t at) { return view.field && view.field->has(at); };
    const bool isChosen = view.part == BrowsePart::Content && offset == view.chosenByte;
    const bool afterChosen = view.part == BrowsePart::Content && !isFirst && offset == view.chosenByte + 1;
    const bool begins = inField(offset) && (isFirst || !inField(offset - 1));
    const bool ends = !isFirst && inField(offset - 1) && !inField(offset);
    std::string before = " ";
    if (isChosen)
        before = ">";
    else if (begins)
        before = "[";
    else if (afterChosen)
        before = "<";
    else if (ends)
        before = "]";
    const Style style = isChosen ? Style::Chosen : inField(offset) ? Style::Changed : Style::Plain;
    return {{before, Style::Plain}, {hex(view.bytes[offset], 2), style}};
}

} // namespace

std::vector<StyledLine> listLines(const BrowseView& view, std::size_t rows) {
    std::vector<StyledLine> lines;
    for (std::size_t i = 0; i < view.rows.size() && i < rows; ++i) {
        const bool isChosen = i == view.chosenRow;
        const Style style = isChosen && view.part == BrowsePart::Messages ? Style::Chosen
                            : isChosen                                    ? Style::Heading
                                                                          : Style::Plain;
        lines.push_back({{(isChosen ? ">" : " ") + rowText(view.rows[i]), style}});
    }
    lines.resize(rows);
    return lines;
}

std::vector<StyledLine> displayLines(const BrowseView& view, std::size_t rows, std::size_t columns) {
    std::vector<StyledLine> lines;
    std::size_t nameWidth = 0;
    for (const DisplayRow& row : view.display)
        if (!row.isBranch)
            nameWidth = std::max(nameWidth, 2 * row.depth + displayWidth(row.name));
    nameWidth = std::min(nameWidth, columns / 2);
    for (std::size_t i = view.firstDisplayRow; i < view.display.size() && lines.size() < rows; ++i) {
        const DisplayRow& row = view.display[i];
        const bool isChosen = i == view.chosenDisplayRow && view.part == BrowsePart::Display;
        std::string name = std::string(2 * row.depth, ' ') + row.name;
        if (!row.isBranch) {
            name = clipped(name, nameWidth);
            name.append(nameWidth - displayWidth(name) + 1, ' ');
        }
        const char* const mark = isChosen ? ">" : row.hasChanged ? "*" : row.isReported ? "=" : " ";
        lines.push_back({{mark + name + row.value, isChosen ? Style::Chosen : styleOf(row)}});
    }
    lines.resize(rows);
    return lines;
}

std::vector<StyledLine> byteLines(const BrowseView& view, std::size_t rows, std::size_t perLine) {
    std::vector<StyledLine> lines;
    const std::size_t chosenLine =
        (view.part == BrowsePart::Content || !view.field ? view.chosenByte : view.field->begin) / perLine;
    const std::size_t all = (view.bytes.size() + perLine - 1) / perLine;
    const std::size_t first =
        all <= rows ? 0 : std::min(chosenLine > rows / 2 ? chosenLine - rows / 2 : 0, all - rows);
    for (std::size_t i = first; i < all && lines.size() < rows; ++i) {
        StyledLine line{{hex(i * perLine, 4) + " ", Style::Dim}};
        std::string text;
        const std::size_t end = std::min((i + 1) * perLine, view.bytes.size());
        for (std::size_t offset = i * perLine; offset < end; ++offset) {
            for (StyledSpan& span : byteSpans(view, offset, offset == i * perLine))
                line.push_back(std::move(span));
            const std::uint8_t byte = view.bytes[offset];
            text += byte >= 0x20 && byte < 0x7F ? static_cast<char>(byte) : '.';
        }
        const bool closes = view.field && view.field->has(end - 1);
        const bool closesChosen = view.part == BrowsePart::Content && view.chosenByte == end - 1;
        line.push_back({closesChosen ? "<" : closes ? "]" : " "});
        line.push_back({std::string(3 * (i * perLine + perLine - end) + 1, ' ') + text, Style::Dim});
        lines.push_back(std::move(line));
    }
    lines.resize(rows);
    return lines;
}

std::vector<StyledLine> eventLines(const BrowseView& view, std::size_t rows, std::size_t) {
    std::vector<StyledLine> lines;
    if (view.events.empty())
        lines.push_back({{" " + view.eventsNews, Style::Dim}});
    for (std::size_t i = 0; i < view.events.size() && lines.size() < rows; ++i) {
        const BrowsedEvent& event = view.events[i];
        const bool isChosen = i == view.chosenEvent;
        const Style style = isChosen && view.part == BrowsePart::Events ? Style::Chosen
                            : event.severity != Severity::Info          ? Style::Warning
                                                                        : Style::Plain;
        lines.push_back({{(isChosen ? ">" : " ") + eventText(event), style}});
    }
    lines.resize(rows);
    return lines;
}

} // namespace velmora
