// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Widgets/Tables/ReuseQueue.h"

#include <cstddef>
#include <map>
#include <memory>
#include <optional>
#include <string_view>

namespace velmora {

class CellWidget;
class TableCell;
class TableWidget;

/// The cells of a table's rows on the screen, by row, and those that wait to be used again. Its table owns
/// it.
class ShownCells {
public:
    explicit ShownCells(TableWidget& table) : _table(table) {}

    /// Null for a row whose cell is being made.
    [[nodiscard]] const std::map<std::size_t, std::shared_ptr<TableCell>>& all() const { return _cells; }
    /// Null for a row that is not on the screen.
    [[nodiscard]] CellWidget* widget(std::optional<std::size_t> row) const;
    /// A cell that waits to be used again; null if there is none of that kind.
    [[nodiscard]] std::shared_ptr<TableCell> dequeue(std::string_view identifier);

    /// Has cells for the rows from `first` on before `end` alone, each in its place. Precondition: the table
    /// has its view and a data source that has these rows.
    void show(std::size_t first, std::size_t end);
    /// Lets all cells wait to be used again. They stay where they are until `show`.
    void recycleAll();
    /// Lets go of all cells, which others may hold.
    void clear();

private:
    void recycle(std::size_t row);
    [[nodiscard]] std::shared_ptr<TableCell> make(std::size_t row);

    TableWidget& _table;
    std::map<std::size_t, std::shared_ptr<TableCell>> _cells;
    ReuseQueue _queue;
};

} // namespace velmora
