// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Accessibility.h"

#include "Toolkit/Tables/TableCell.h"
#include "Toolkit/Tables/TableView.h"
#include "Toolkit/Widgets/Charts/ChartAccessible.h"
#include "Toolkit/Widgets/Charts/ChartWidget.h"
#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/HeaderBar.h"
#include "Toolkit/Widgets/SheetWidget.h"
#include "Toolkit/Widgets/SpinnerWidget.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"
#include "Toolkit/Widgets/WrappedLabel.h"

#include <QAccessible>
#include <QAccessibleWidget>

#include <iterator>
#include <utility>

namespace velmora {

namespace {

/// The table a row's widget is in, or null.
TableWidget* tableOf(const CellWidget& cell) {
    QWidget* const viewport = cell.parentWidget();
    return viewport ? dynamic_cast<TableWidget*>(viewport->parentWidget()) : nullptr;
}

/// A list of the rows on the screen.
class TableAccessible : public QAccessibleWidget {
public:
    explicit TableAccessible(TableWidget& table)
        : QAccessibleWidget(&table, QAccessible::List), _table(table) {}

    [[nodiscard]] int childCount() const override { return static_cast<int>(_table.cells().size()); }
    [[nodiscard]] QAccessibleInterface* child(int index) const override {
        if (index < 0 || index >= childCount())
            return nullptr;
        return QAccessible::queryAccessibleInterface(
            std::next(_table.cells().begin(), index)->second->widget());
    }
    [[nodiscard]] int indexOfChild(const QAccessibleInterface* child) const override {
        for (int index = 0; index < childCount(); ++index)
            if (std::next(_table.cells().begin(), index)->second->widget() == child->object())
                return index;
        return -1;
    }
    [[nodiscard]] QAccessibleInterface* childAt(int x, int y) const override {
        const auto row = _table.rowAt(_table.viewport()->mapFromGlobal(QPoint(x, y)));
        return QAccessible::queryAccessibleInterface(_table.cellWidget(row));
    }
    [[nodiscard]] QAccessibleInterface* focusChild() const override {
        CellWidget* const cell = _table.hasFocus() ? _table.cellWidget(_table.focusRow()) : nullptr;
        return cell ? QAccessible::queryAccessibleInterface(cell) : nullptr;
    }

private:
    TableWidget& _table;
};

/// A row: one thing with a name, whatever it is made of.
class RowAccessible : public QAccessibleWidget {
public:
    explicit RowAccessible(CellWidget& cell) : QAccessibleWidget(&cell, QAccessible::ListItem), _cell(cell) {}

    [[nodiscard]] QAccessibleInterface* parent() const override {
        TableWidget* const table = tableOf(_cell);
        return table ? QAccessible::queryAccessibleInterface(table) : QAccessibleWidget::parent();
    }
    [[nodiscard]] int childCount() const override { return 0; }
    [[nodiscard]] QAccessibleInterface* child(int) const override { return nullptr; }
    [[nodiscard]] QString text(QAccessible::Text which) const override {
        if (which == QAccessible::Name && _cell.cell)
            return toQt(_cell.cell->rowName());
        return QAccessibleWidget::text(which);
    }
    [[nodiscard]] QAccessible::State state() const override {
        QAccessible::State state = QAccessibleWidget::state();
        const TableWidget* const table = tableOf(_cell);
        state.focusable = true;
        state.selectable = true;
        state.selected = _cell.isSelected();
        state.focused = table && table->hasFocus() && _cell.row && table->focusRow() == _cell.row;
        return state;
    }
    [[nodiscard]] QStringList actionNames() const override { return {pressAction()}; }
    void doAction(const QString& name) override {
        TableWidget* const table = tableOf(_cell);
        if (name == pressAction() && table && _cell.row)
            table->activateRow(*_cell.row);
    }

private:
    CellWidget& _cell;
};

class SpinnerAccessible : public QAccessibleWidget {
public:
    explicit SpinnerAccessible(SpinnerWidget& spinner)
        : QAccessibleWidget(&spinner, QAccessible::Animation), _spinner(spinner) {}

    [[nodiscard]] QAccessible::State state() const override {
        QAccessible::State state = QAccessibleWidget::state();
        state.busy = _spinner.isSpinning();
        state.animated = _spinner.isTurning();
        return state;
    }

private:
    SpinnerWidget& _spinner;
};

AnnouncementListener theListener;

QAccessibleInterface* makeInterface(const QString& /*className*/, QObject* object) {
    if (auto* const table = dynamic_cast<TableWidget*>(object))
        return new TableAccessible(*table);
    if (auto* const cell = dynamic_cast<CellWidget*>(object))
        return new RowAccessible(*cell);
    if (auto* const heading = dynamic_cast<HeadingLabel*>(object))
        return new QAccessibleWidget(heading, QAccessible::Heading);
    if (auto* const notice = dynamic_cast<WrappedLabel*>(object))
        return new QAccessibleWidget(notice, QAccessible::AlertMessage);
    if (auto* const sheet = dynamic_cast<SheetWidget*>(object))
        return new QAccessibleWidget(sheet, QAccessible::Dialog);
    if (auto* const spinner = dynamic_cast<SpinnerWidget*>(object))
        return new SpinnerAccessible(*spinner);
    if (auto* const chart = dynamic_cast<ChartWidget*>(object))
        return new ChartAccessible(*chart);
    return nullptr;
}

} // namespace

void installAccessibility() {
    QAccessible::installFactory(makeInterface);
}

void announce(QWidget& widget, QAccessible::Event what) {
    if (theListener)
        theListener(widget, what);
    QAccessibleEvent event(&widget, what);
    QAccessible::updateAccessibility(&event);
}

bool hasAnnouncementListener() {
    return theListener || QAccessible::isActive();
}

void setAnnouncementListener(AnnouncementListener listener) {
    theListener = std::move(listener);
}

} // namespace velmora
