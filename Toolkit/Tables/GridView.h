// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Color.h"
#include "Toolkit/Label.h"
#include "Toolkit/View.h"

#include <cstddef>
#include <functional>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

class GridWidget;

/// A column of a grid.
struct GridColumn {
    std::string title;
    std::string widest; ///< a text that fits; the rest of the width goes to columns without one
    TextAlignment alignment = TextAlignment::left;
};

/// A cell: a text and, where there is one, a bar below it.
struct GridCell {
    std::string text{};
    std::optional<double> bar{}; ///< its length, 0 to 1
    Color color = Color::automatic;
    std::string spoken{}; ///< for screen readers; the text where it is empty

    friend bool operator==(const GridCell&, const GridCell&) = default;
};

using GridRow = std::vector<GridCell>;

/// A table of several columns with a head. Texts that do not fit end in an ellipsis. Arrows move from cell to
/// cell; a tap or click, Enter and Space choose a row.
class GridView : public View {
public:
    GridView();
    ~GridView() override;

    void setColumns(std::vector<GridColumn> columns);
    /// Only what is different is drawn; the scroll position and the chosen row's place stay.
    void setRows(std::vector<GridRow> rows);
    [[nodiscard]] const std::vector<GridRow>& rows() const;
    /// What an empty grid says.
    void setPlaceholder(std::string_view text);
    /// Called with the row that the user chooses. Rows are as high as a finger needs from then on.
    void setOnChoose(std::function<void(std::size_t row)> choose);
    /// In points, of so many rows and the head.
    [[nodiscard]] double heightOfRows(std::size_t rows) const;

private:
    GridWidget* _grid;
};

} // namespace velmora
