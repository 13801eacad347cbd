// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Screen/LevelStrip.h"

#include "Platform/UTF8.h"

#include <algorithm>
#include <cstdio>

namespace velmora {

namespace {

struct Range {
    double lowest;
    double highest;
};

std::optional<Range> rangeOf(const std::vector<std::optional<double>>& levels) {
    std::optional<Range> range;
    for (const std::optional<double>& level : levels)
        if (level && range)
            range = Range{std::min(range->lowest, *level), std::max(range->highest, *level)};
        else if (level)
            range = Range{*level, *level};
    return range;
}

/// Which of so many equal parts of the range it lies in, from 1; 0 for nothing.
std::size_t partOf(const std::optional<double>& level, const Range& range, std::size_t parts) {
    if (!level)
        return 0;
    const double width = range.highest - range.lowest;
    const double place = width > 0 ? (*level - range.lowest) / width : 1;
    return 1 + std::min(static_cast<std::size_t>(place * static_cast<double>(parts)), parts - 1);
}

/// Dots from the bottom up: those of braille's left column are 7, 3, 2, 1, of its right one 8, 6, 5, 4.
constexpr unsigned leftDots[] = {0, 0x40, 0x44, 0x46, 0x47};
constexpr unsigned rightDots[] = {0, 0x80, 0xA0, 0xB0, 0xB8};

std::size_t columnOf(double place, std::size_t columns) {
    return std::min(static_cast<std::size_t>(place * static_cast<double>(columns)), columns - 1);
}

} // namespace

std::string levelRow(const std::vector<std::optional<double>>& levels, std::size_t columns,
                     Characters characters) {
    const std::optional<Range> range = rangeOf(levels);
    if (!range || levels.size() < 2 * columns)
        return std::string(columns, ' ');
    std::string row;
    for (std::size_t i = 0; i < columns; ++i) {
        const std::optional<double>& left = levels[2 * i];
        const std::optional<double>& right = levels[2 * i + 1];
        if (characters == Characters::ASCII) {
            constexpr std::string_view ramp = " .:-=+*#";
            const std::optional<double> both = left && right ? std::optional((*left + *right) / 2)
                                               : left        ? left
                                                             : right;
            row += ramp[partOf(both, *range, ramp.size() - 1)];
        } else if (const unsigned dots =
                       leftDots[partOf(left, *range, 4)] | rightDots[partOf(right, *range, 4)];
                   dots != 0) {
            appendUTF8(row, 0x2800 + dots);
        } else {
            row += ' ';
        }
    }
    return row;
}

std::vector<StyledLine> stripLines(const BrowseView& view, std::size_t columns, Characters characters) {
    char label[48] = "";
    if (const std::optional<Range> range = rangeOf(view.levels))
        std::snprintf(label, sizeof label, "%.0f to %.0f dBm", range->lowest, range->highest);
    std::string marks(columns, ' ');
    for (const double place : view.eventPlaces)
        marks[columnOf(place, columns)] = '!';
    const std::string_view text = label;
    if (text.size() < columns)
        std::copy(text.begin(), text.end(), marks.end() - static_cast<std::ptrdiff_t>(text.size()));
    if (view.place01)
        marks[columnOf(*view.place01, columns)] = '^';
    return {{{levelRow(view.levels, columns, characters), Style::Plain}}, {{marks, Style::Dim}}};
}

} // namespace velmora
