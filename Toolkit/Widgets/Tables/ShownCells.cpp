// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/ShownCells.h"

#include "Toolkit/Tables/TableCell.h"
#include "Toolkit/Tables/TableView.h"
#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Scrolling/ScrollWidget.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"

#include <utility>
#include <vector>

namespace velmora {

CellWidget* ShownCells::widget(std::optional<std::size_t> row) const {
    const auto found = row ? _cells.find(*row) : _cells.end();
    return found == _cells.end() ? nullptr : static_cast<CellWidget*>(found->second->widget());
}

std::shared_ptr<TableCell> ShownCells::dequeue(std::string_view identifier) {
    std::shared_ptr<TableCell> cell = _queue.take(identifier);
    if (!cell)
        return nullptr;
    cell->setFrame({0, cell->frame().y, static_cast<double>(_table.viewport()->width()),
                    static_cast<double>(_table.rowHeight())});
    cell->prepareForReuse();
    return cell;
}

void ShownCells::show(std::size_t first, std::size_t end) {
    std::vector<std::size_t> leaving;
    for (const auto& [row, cell] : _cells)
        if (row < first || row >= end)
            leaving.push_back(row);
    for (const std::size_t row : leaving)
        recycle(row);
    for (std::size_t row = first; row < end; ++row) {
        std::shared_ptr<TableCell>& cell = _cells[row];
        if (!cell)
            cell = make(row);
        cell->setFrame(fromQt(_table.rowRect(row)));
        cell->setHidden(false);
    }
    _queue.hideAll();
}

void ShownCells::recycleAll() {
    while (!_cells.empty())
        recycle(_cells.rbegin()->first);
}

void ShownCells::clear() {
    for (const auto& [row, cell] : _cells)
        cell->widget()->setParent(nullptr);
    _cells.clear();
    _queue.clear();
}

void ShownCells::recycle(std::size_t row) {
    const auto node = _cells.extract(row);
    static_cast<CellWidget*>(node.mapped()->widget())->row.reset();
    _queue.add(node.mapped());
}

std::shared_ptr<TableCell> ShownCells::make(std::size_t row) {
    std::shared_ptr<TableCell> cell =
        _table.dataSource->cellForRowAtIndexPath(*_table.view, _table.rows().path(row));
    if (!cell)
        cell = std::make_shared<TableCell>(TableCellStyle::plain, std::string());
    auto* const widget = static_cast<CellWidget*>(cell->widget());
    if (widget->parentWidget() != _table.viewport())
        widget->setParent(_table.viewport());
    widget->row = row;
    if (std::exchange(widget->lastRow, row) != row)
        for (QObject* const child : widget->findChildren<QWidget*>())
            if (auto* const scroller = dynamic_cast<ScrollWidget*>(child))
                scroller->setOffset(0);
    cell->setFrame(fromQt(_table.rowRect(row)));
    cell->layoutSubviews(); // its texts may be others than when it was last laid out
    return cell;
}

} // namespace velmora
