// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Tables/IndexPath.h"
#include "Toolkit/Tables/TableViewDataSource.h"
#include "Toolkit/Tables/TableViewDelegate.h"
#include "Toolkit/View.h"

#include <memory>
#include <string_view>
#include <vector>

namespace velmora {

class TableCell;
class TableWidget;

/// Rows below each other, all of one height (at least 44 points, more where the system font needs it). Only
/// rows on the screen have cells.
///
/// Recycling. Cells without a row are queued by their reuse identifier, last in, first out. A row that leaves
/// the screen queues its cell (of several rows the topmost first); `reloadData` queues all of them, the
/// bottom row's first, and requests the rows from the top down: so as long as rows keep their identifiers
/// each gets back its cell.
///
/// A reload keeps the scroll position, the focused row and the selected row, if those rows still exist, and
/// draws once. Arrows, Page Up/Down, Home and End move the focus row, Enter or Space selects it, left and
/// right move what scrolls sideways in it.
class TableView : public View {
public:
    TableView();
    ~TableView() override;

    /// Neither is owned; null for none. The table is empty until it has a data source and is shown or
    /// reloaded.
    void setDataSource(TableViewDataSource* dataSource);
    void setDelegate(TableViewDelegate* delegate);

    /// What the table says while it has no rows; nothing at first.
    void setEmptyText(std::string_view text);

    /// Queries the data source again for everything.
    void reloadData();
    /// A queued cell of that identifier, or null.
    [[nodiscard]] std::shared_ptr<TableCell> dequeueReusableCell(std::string_view identifier);

    [[nodiscard]] std::size_t numberOfSections() const;
    /// 0 for a section that does not exist. As of the last reload.
    [[nodiscard]] std::size_t numberOfRowsInSection(std::size_t section) const;
    /// The row's cell while it is on the screen, else null.
    [[nodiscard]] std::shared_ptr<TableCell> cellForRow(const IndexPath& indexPath) const;
    /// From the top.
    [[nodiscard]] std::vector<IndexPath> indexPathsForVisibleRows() const;
    [[nodiscard]] double rowHeight() const;
    /// In the coordinates of the table's inside, scrolled as it is; empty for no row.
    [[nodiscard]] Rect rectForRow(const IndexPath& indexPath) const;

    /// Null when none is.
    [[nodiscard]] IndexPath indexPathForSelectedRow() const;
    /// Does not notify the delegate. A path that names no row selects none.
    void selectRow(const IndexPath& indexPath, bool animated);
    /// Nothing when the row is not the selected one.
    void deselectRow(const IndexPath& indexPath, bool animated);

    /// The row that the keyboard is on; null before the table was ever focused.
    [[nodiscard]] IndexPath indexPathForFocusRow() const;
    void setFocusRow(const IndexPath& indexPath);

    /// How far the rows are scrolled up, in points.
    [[nodiscard]] double contentOffset() const;
    /// Kept within what there is to scroll.
    void setContentOffset(double y);
    void scrollToRow(const IndexPath& indexPath);

    /// The height of all rows, or of one where the table says that it is empty, though no more than is left
    /// of the superview below the origin.
    void sizeToFit() override;

private:
    explicit TableView(TableWidget* widget);

    TableWidget* _table;
};

} // namespace velmora
