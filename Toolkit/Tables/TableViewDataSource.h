// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Tables/IndexPath.h"
#include "Toolkit/Tables/TableRowSummary.h"

#include <cstddef>
#include <memory>

namespace velmora {

class TableCell;
class TableView;

/// Provides a table's content. Outlives the table's use of it.
class TableViewDataSource {
public:
    virtual ~TableViewDataSource() = default;
    /// 1 unless overridden.
    [[nodiscard]] virtual std::size_t numberOfSections(TableView& tableView);
    [[nodiscard]] virtual std::size_t numberOfRowsInSection(TableView& tableView, std::size_t section) = 0;
    /// The cell for a row that comes onto the screen: one from `dequeueReusableCell`, or a fresh one. Null
    /// shows an empty row.
    [[nodiscard]] virtual std::shared_ptr<TableCell> cellForRowAtIndexPath(TableView& tableView,
                                                                           const IndexPath& indexPath) = 0;
    /// What screen readers say of a row that is not on the screen; it makes no cell. The default knows
    /// nothing.
    [[nodiscard]] virtual TableRowSummary summaryOfRowAtIndexPath(TableView& tableView,
                                                                  const IndexPath& indexPath);
};

} // namespace velmora
