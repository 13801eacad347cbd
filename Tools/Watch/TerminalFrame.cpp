// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Watch/TerminalFrame.h"

#include "Platform/PrintableText.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr const char* home = "\x1b[H";
constexpr const char* clearToEndOfLine = "\x1b[K";
constexpr const char* bold = "\x1b[1m";
constexpr const char* reverse = "\x1b[7m";
constexpr const char* plain = "\x1b[0m";

/// Columns grow in such steps, so that a value which gains a digit does not move the entire screen.
constexpr std::size_t widthStep = 8;

std::string statusLine(std::string_view status, const ScreenLayout& layout, std::size_t scroll,
                       std::size_t columns) {
    std::string right;
    if (layout.maximumScroll() != 0 && layout.pageSize() != 0)
        right = std::to_string(scroll + 1) + "-" + std::to_string(scroll + layout.pageSize()) + "/" +
                std::to_string(layout.rows);
    std::string left = clipped(status, columns);
    const std::size_t used = displayWidth(left) + right.size();
    if (used + 1 > columns)
        right.clear();
    left.append(columns - displayWidth(left) - right.size(), ' ');
    return reverse + left + right + plain;
}

} // namespace

ScreenLayout layoutOf(const std::vector<TreeRow>& rows, ScreenSize size) {
    ScreenLayout layout;
    layout.rows = rows.size();
    layout.rowsPerColumn = size.rows > 1 ? size.rows - 1 : 0;
    layout.columnWidth = size.columns;
    if (layout.rowsPerColumn == 0 || rows.empty())
        return layout;
    std::size_t widest = 0;
    for (const TreeRow& row : rows)
        widest = std::max(widest, displayWidth(row.text));
    const std::size_t width = (widest / widthStep + 1) * widthStep;
    const std::size_t needed = (rows.size() + layout.rowsPerColumn - 1) / layout.rowsPerColumn;
    const std::size_t fitting = (size.columns + columnGap) / (width + columnGap);
    layout.columns = std::clamp<std::size_t>(fitting, 1, needed);
    if (layout.columns > 1)
        layout.columnWidth = (size.columns - columnGap * (layout.columns - 1)) / layout.columns;
    return layout;
}

ScreenSize withoutEvents(ScreenSize size, std::string_view events) {
    if (!events.empty() && size.columns >= smallestWithEvents.columns && size.rows >= smallestWithEvents.rows)
        --size.rows;
    return size;
}

std::string composeFrame(const std::vector<TreeRow>& rows, std::string_view status, ScreenSize size,
                         std::size_t scroll, std::string_view events) {
    const ScreenSize rest = withoutEvents(size, events);
    const ScreenLayout layout = layoutOf(rows, rest);
    const std::size_t first = std::min(scroll, layout.maximumScroll());
    std::string frame = home;
    for (std::size_t line = 0; line < layout.rowsPerColumn; ++line) {
        std::size_t column = 0;
        for (std::size_t i = 0; i < layout.columns; ++i) {
            const std::size_t index = first + i * layout.rowsPerColumn + line;
            if (index >= rows.size())
                break;
            const std::size_t start = i * (layout.columnWidth + columnGap);
            frame.append(start - column, ' ');
            const std::string text = clipped(rows[index].text, layout.columnWidth);
            column = start + displayWidth(text);
            frame += rows[index].isBranch ? bold + text + plain : text;
        }
        // After a full line the cursor is still on its last character, which clearing would erase.
        if (column < size.columns)
            frame += clearToEndOfLine;
        frame += "\r\n";
    }
    if (rest.rows < size.rows) {
        const std::string line = clipped(events, size.columns);
        frame += line;
        if (displayWidth(line) < size.columns)
            frame += clearToEndOfLine;
        frame += "\r\n";
    }
    frame += statusLine(status, layout, first, size.columns);
    return frame;
}

std::vector<TreeRow> adviceRows(std::string_view text, std::size_t columns) {
    std::vector<TreeRow> rows;
    while (!text.empty()) {
        std::size_t length = text.size();
        if (length > columns) {
            const std::size_t blank = text.rfind(' ', columns);
            length = blank == text.npos || blank == 0 ? columns : blank;
        }
        rows.push_back({std::string(text.substr(0, length)), false});
        text.remove_prefix(length);
        while (text.starts_with(' '))
            text.remove_prefix(1);
    }
    return rows;
}

std::size_t scrolledBy(Key key, std::size_t scroll, const ScreenLayout& layout) {
    const std::size_t last = layout.maximumScroll();
    const std::size_t page = std::max<std::size_t>(layout.pageSize(), 1);
    scroll = std::min(scroll, last);
    switch (key) {
    case Key::Up: return scroll - std::min<std::size_t>(scroll, 1);
    case Key::Down: return std::min(scroll + 1, last);
    case Key::PageUp: return scroll - std::min(scroll, page);
    case Key::PageDown: return std::min(scroll + page, last);
    case Key::Home: return 0;
    case Key::End: return last;
    default: break;
    }
    return scroll;
}

} // namespace velmora
