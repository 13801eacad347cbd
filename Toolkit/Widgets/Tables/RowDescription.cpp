// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/RowDescription.h"

#include "Toolkit/Tables/TableViewDataSource.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"

namespace velmora {

TableRowSummary rowSummary(const TableWidget& table, std::size_t row) {
    if (const CellWidget* const shown = table.cells().widget(row); shown && shown->cell)
        return {shown->cell->rowName(), shown->cell->accessory()};
    const IndexPath path = table.rows().path(row);
    return table.dataSource && table.view && !path.isNull()
               ? table.dataSource->summaryOfRowAtIndexPath(*table.view, path)
               : TableRowSummary();
}

QAccessible::State rowState(const TableWidget& table, std::size_t row, TableCellAccessory accessory) {
    QAccessible::State state;
    state.focusable = true;
    state.selectable = true;
    state.selected = table.selectedRow() == row;
    state.focused = table.hasFocus() && table.focusRow() == row;
    state.offscreen = !table.cells().widget(row);
    state.invisible = !table.isVisible();
    state.expandable = accessory == TableCellAccessory::disclosureIndicator;
    state.collapsed = state.expandable;
    // A mark that only says that it is so: it cannot be taken off.
    state.checkable = accessory == TableCellAccessory::checkMark;
    state.checked = state.checkable;
    state.readOnly = state.checkable;
    return state;
}

QString rowDescription(TableCellAccessory accessory) {
    return accessory == TableCellAccessory::disclosureIndicator ? QStringLiteral("Opens a list") : QString();
}

void doRowAction(TableWidget& table, std::size_t row, const QString& action) {
    if (row >= table.rows().total())
        return;
    if (action == QAccessibleActionInterface::pressAction()) {
        table.scrollToRow(row);
        table.activateRow(row);
    } else if (action == QAccessibleActionInterface::setFocusAction()) {
        table.setFocus(Qt::OtherFocusReason);
        table.setFocusRow(row);
    }
}

} // namespace velmora
