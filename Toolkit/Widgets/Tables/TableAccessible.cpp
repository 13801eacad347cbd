// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/TableAccessible.h"

#include "Toolkit/Widgets/Tables/CellWidget.h"
#include "Toolkit/Widgets/Tables/EmptyLabel.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"
#include "Toolkit/Widgets/Tables/UnseenRow.h"

namespace velmora {

TableAccessible::TableAccessible(TableWidget& table)
    : QAccessibleWidget(&table, QAccessible::List), _table(table) {}

TableAccessible::~TableAccessible() {
    for (const auto& [row, id] : _unseen)
        QAccessible::deleteAccessibleInterface(id);
}

int TableAccessible::childCount() const {
    const bool saysEmpty = !_table.emptyLabel().isHidden();
    return saysEmpty ? 1 : static_cast<int>(_table.rows().total());
}

QAccessibleInterface* TableAccessible::child(int index) const {
    if (index < 0 || index >= childCount())
        return nullptr;
    const auto row = static_cast<std::size_t>(index);
    if (row >= _table.rows().total())
        return QAccessible::queryAccessibleInterface(&_table.emptyLabel());
    if (CellWidget* const cell = _table.cells().widget(row))
        return QAccessible::queryAccessibleInterface(cell);
    const auto [found, isNew] = _unseen.try_emplace(row);
    if (isNew)
        found->second = QAccessible::registerAccessibleInterface(new UnseenRow(_table, row));
    return QAccessible::accessibleInterface(found->second);
}

int TableAccessible::indexOfChild(const QAccessibleInterface* child) const {
    if (!child)
        return -1;
    if (child->object() == &_table.emptyLabel())
        return 0;
    if (const auto* const cell = dynamic_cast<const CellWidget*>(child->object()))
        return cell->row && _table.cells().widget(cell->row) == cell ? static_cast<int>(*cell->row) : -1;
    const auto* const unseen = dynamic_cast<const UnseenRow*>(child);
    return unseen && unseen->isValid() ? static_cast<int>(unseen->row()) : -1;
}

QAccessibleInterface* TableAccessible::childAt(int x, int y) const {
    const auto row = _table.rowAt(_table.viewport()->mapFromGlobal(QPoint(x, y)));
    return QAccessible::queryAccessibleInterface(_table.cells().widget(row));
}

QAccessibleInterface* TableAccessible::focusChild() const {
    CellWidget* const cell = _table.hasFocus() ? _table.cells().widget(_table.focusRow()) : nullptr;
    return cell ? QAccessible::queryAccessibleInterface(cell) : nullptr;
}

} // namespace velmora
