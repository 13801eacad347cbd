// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Screen/BrowseLayout.h"

#include <algorithm>

namespace velmora {

namespace {

/// "0010  00 11 22 33 44 55 66 77  ........"
constexpr std::size_t bytesWidth(std::size_t perLine) {
    return 4 + 2 + perLine * 3 - 1 + 2 + perLine;
}

} // namespace

BrowseLayout BrowseLayout::of(ScreenSize size) {
    BrowseLayout layout;
    layout.columns = size.columns;
    // The bar on top and the status line.
    const std::size_t rest = size.rows > 2 ? size.rows - 2 : 0;
    constexpr std::size_t smallestRows = 12;
    constexpr std::size_t smallestColumns = 60;
    if (rest < smallestRows || size.columns < smallestColumns) {
        layout.listRows = rest;
        return layout;
    }
    layout.stripRows = 2;
    const std::size_t parts = rest - layout.stripRows - 1;
    layout.listRows = parts * 2 / 5;
    layout.lowerRows = parts - layout.listRows;
    constexpr std::size_t gap = 1;
    layout.bytesPerLine = size.columns >= 140 ? 16 : 8;
    layout.bytesColumns = bytesWidth(layout.bytesPerLine);
    std::size_t others = size.columns - layout.bytesColumns - gap;
    if (size.columns >= 140) {
        layout.eventsColumns = others / 2;
        others -= layout.eventsColumns + gap;
    }
    layout.displayColumns = others;
    return layout;
}

} // namespace velmora
