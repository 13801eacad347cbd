// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Accessibility.h"

#include "Toolkit/Tables/TableCell.h"
#include "Toolkit/Widgets/Bars/Toolbar.h"
#include "Toolkit/Widgets/Charts/ChartAccessible.h"
#include "Toolkit/Widgets/Charts/ChartWidget.h"
#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Navigation/SheetWidget.h"
#include "Toolkit/Widgets/SpinnerWidget.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"
#include "Toolkit/Widgets/Tables/EmptyLabel.h"
#include "Toolkit/Widgets/Tables/RowDescription.h"
#include "Toolkit/Widgets/Tables/TableAccessible.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"
#include "Toolkit/Widgets/Text/WrappedLabel.h"
#include "Toolkit/Widgets/WindowWidget.h"

#include <QAccessible>
#include <QAccessibleWidget>
#include <QLabel>

#include <utility>

namespace velmora {

namespace {

/// The table a row's widget is in, or null.
TableWidget* tableOf(const CellWidget& cell) {
    QWidget* const viewport = cell.parentWidget();
    return viewport ? dynamic_cast<TableWidget*>(viewport->parentWidget()) : nullptr;
}

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
        if (which == QAccessible::Description && _cell.cell)
            return rowDescription(_cell.cell->accessory());
        return QAccessibleWidget::text(which);
    }
    [[nodiscard]] QAccessible::State state() const override {
        const TableWidget* const table = tableOf(_cell);
        if (!table || !_cell.row || !_cell.cell)
            return QAccessibleWidget::state();
        return rowState(*table, *_cell.row, _cell.cell->accessory());
    }
    [[nodiscard]] QStringList actionNames() const override { return {pressAction(), setFocusAction()}; }
    void doAction(const QString& name) override {
        TableWidget* const table = tableOf(_cell);
        if (table && _cell.row)
            doRowAction(*table, *_cell.row, name);
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

/// A text, which is called by itself where it has no other name. Whether it is a heading may be set later.
class TextAccessible : public QAccessibleWidget {
public:
    explicit TextAccessible(QLabel& label)
        : QAccessibleWidget(&label, QAccessible::StaticText), _label(label) {}

    [[nodiscard]] QAccessible::Role role() const override {
        const auto* const label = dynamic_cast<const LabelWidget*>(&_label);
        return label && label->isHeading() ? QAccessible::Heading : QAccessible::StaticText;
    }
    [[nodiscard]] QString text(QAccessible::Text which) const override {
        const bool isNamed = which != QAccessible::Name || !_label.accessibleName().isEmpty();
        return isNamed ? QAccessibleWidget::text(which) : _label.text();
    }

private:
    QLabel& _label;
};

/// Nothing below it can be used.
class SheetAccessible : public QAccessibleWidget {
public:
    explicit SheetAccessible(SheetWidget& sheet) : QAccessibleWidget(&sheet, QAccessible::Dialog) {}

    [[nodiscard]] QAccessible::State state() const override {
        QAccessible::State state = QAccessibleWidget::state();
        state.modal = true;
        return state;
    }
};

AnnouncementListener theListener;

QAccessibleInterface* makeInterface(const QString& /*className*/, QObject* object) {
    if (auto* const table = dynamic_cast<TableWidget*>(object))
        return new TableAccessible(*table);
    if (auto* const cell = dynamic_cast<CellWidget*>(object))
        return new RowAccessible(*cell);
    if (auto* const label = dynamic_cast<LabelWidget*>(object))
        return new TextAccessible(*label);
    if (auto* const empty = dynamic_cast<EmptyLabel*>(object))
        return new TextAccessible(*empty);
    if (auto* const notice = dynamic_cast<WrappedLabel*>(object))
        return new QAccessibleWidget(notice, QAccessible::AlertMessage);
    if (auto* const sheet = dynamic_cast<SheetWidget*>(object))
        return new SheetAccessible(*sheet);
    if (auto* const window = dynamic_cast<WindowWidget*>(object))
        return new QAccessibleWidget(window, QAccessible::Window);
    if (auto* const toolbar = dynamic_cast<Toolbar*>(object))
        return new QAccessibleWidget(toolbar, QAccessible::ToolBar);
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
