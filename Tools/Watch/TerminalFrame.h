// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Terminal/KeyPress.h"
#include "Tools/Terminal/ScreenSize.h"
#include "Tools/Text/TreeText.h"

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// What a terminal shows of the display tree, as plain functions that need no terminal.

/// How rows are laid out on a screen: in columns that are read one after the other, as many as the rows need
/// and the window has width for, above the status line, which is the last row.
struct ScreenLayout {
    std::size_t columns = 1;
    std::size_t columnWidth = 0;   ///< terminal columns
    std::size_t rowsPerColumn = 0; ///< 0 in a window that has room for the status line alone
    std::size_t rows = 0;          ///< rows in all, shown or not

    /// Rows that are on the screen at the same time.
    [[nodiscard]] std::size_t pageSize() const { return columns * rowsPerColumn; }
    /// The furthest that it makes sense to scroll: the last row is then the last on the screen.
    [[nodiscard]] std::size_t maximumScroll() const { return rows > pageSize() ? rows - pageSize() : 0; }
};

/// The terminal columns between two columns of rows.
inline constexpr std::size_t columnGap = 3;

[[nodiscard]] ScreenLayout layoutOf(const std::vector<TreeRow>& rows, ScreenSize size);

/// A smaller window has no line of events.
inline constexpr ScreenSize smallestWithEvents{30, 8};

/// What is left of the screen for the rows and the status line when it also shows the events.
[[nodiscard]] ScreenSize withoutEvents(ScreenSize size, std::string_view events);

/// The bytes that redraw the screen in place, without clearing any part in between. `scroll` is the first row
/// shown; one past the layout's maximum counts as the maximum. `events`: a line above the status line, which
/// is left out where it is empty or the window too small.
[[nodiscard]] std::string composeFrame(const std::vector<TreeRow>& rows, std::string_view status,
                                       ScreenSize size, std::size_t scroll, std::string_view events = {});

/// Text in rows of at most that many columns, broken at blanks.
[[nodiscard]] std::vector<TreeRow> adviceRows(std::string_view text, std::size_t columns);

/// The scroll position after a key. What is no key to scroll by leaves it.
[[nodiscard]] std::size_t scrolledBy(Key key, std::size_t scroll, const ScreenLayout& layout);

} // namespace velmora
