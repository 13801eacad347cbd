// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/UnseenRow.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Tables/RowDescription.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"

#include <QWindow>

namespace velmora {

UnseenRow::UnseenRow(TableWidget& table, std::size_t row) : _table(&table), _row(row) {}

bool UnseenRow::isValid() const {
    return _table && _row < _table->rows().total();
}

QWindow* UnseenRow::window() const {
    return _table ? _table->window()->windowHandle() : nullptr;
}

QAccessibleInterface* UnseenRow::parent() const {
    return _table ? QAccessible::queryAccessibleInterface(_table.data()) : nullptr;
}

QString UnseenRow::text(QAccessible::Text which) const {
    if (!isValid())
        return {};
    if (which == QAccessible::Name)
        return toQt(rowSummary(*_table, _row).name);
    return which == QAccessible::Description ? rowDescription(rowSummary(*_table, _row).accessory)
                                             : QString();
}

QRect UnseenRow::rect() const {
    if (!isValid())
        return {};
    const QRect place = _table->rowRect(_row);
    return {_table->viewport()->mapToGlobal(place.topLeft()), place.size()};
}

QAccessible::State UnseenRow::state() const {
    QAccessible::State state;
    if (isValid())
        return rowState(*_table, _row, rowSummary(*_table, _row).accessory);
    state.invalid = true;
    return state;
}

void* UnseenRow::interface_cast(QAccessible::InterfaceType type) {
    return type == QAccessible::ActionInterface ? static_cast<QAccessibleActionInterface*>(this) : nullptr;
}

QStringList UnseenRow::actionNames() const {
    return {pressAction(), setFocusAction()};
}

void UnseenRow::doAction(const QString& name) {
    if (isValid())
        doRowAction(*_table, _row, name);
}

} // namespace velmora
