// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/TableWidget.h"

#include "Toolkit/Tables/TableCell.h"
#include "Toolkit/Tables/TableView.h"
#include "Toolkit/Widgets/Accessibility.h"
#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Scrolling/OverlayScrollBar.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"
#include "Toolkit/Widgets/Tables/EmptyLabel.h"

#include <QContextMenuEvent>
#include <QFocusEvent>
#include <QFontMetricsF>
#include <QMenu>
#include <QPointer>
#include <QResizeEvent>
#include <QScrollBar>

#include <algorithm>
#include <cmath>
#include <utility>

namespace velmora {

TableWidget::TableWidget() : _emptyLabel(new EmptyLabel(*viewport())), _cells(*this), _input(*this) {
    setObjectName("velmora.table");
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setFocusPolicy(Qt::StrongFocus);
    viewport()->setBackgroundRole(QPalette::Base);
    viewport()->setAutoFillBackground(true);
    viewport()->setForegroundRole(QPalette::Text);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
    new OverlayScrollBar(*this);
}

TableWidget::~TableWidget() = default;

void TableWidget::reload() {
    if (!view || _isLayingOut)
        return;
    _isLoaded = true;
    std::vector<std::size_t> counts;
    if (dataSource) {
        counts.resize(dataSource->numberOfSections(*view));
        for (std::size_t section = 0; section < counts.size(); ++section)
            counts[section] = dataSource->numberOfRowsInSection(*view, section);
    }
    const std::size_t before = _rows.total();
    const IndexPath selected = _rows.path(_selected);
    const IndexPath focus = _rows.path(_focus);
    _rows = TableRows(std::move(counts));

    // The cells stay where they are until they have been asked for again, and nothing is drawn before the
    // event loop turns: a row that shows what it showed is not even redrawn.
    _cells.recycleAll();
    _selected = _rows.row(selected);
    _pressed = _pressed && *_pressed < _rows.total() ? _pressed : std::nullopt;
    if (!focus.isNull())
        _focus = _rows.row(focus);
    if (!_focus && (!focus.isNull() || hasFocus()) && _rows.total() > 0)
        _focus = focus.isNull() ? 0 : _rows.total() - 1;
    updateScrollRange();
    layoutRows();
    showEmptyLabel();
    if (_rows.total() != before)
        announce(*this, QAccessible::ObjectReorder);
    for (const auto& [row, cell] : _cells.all())
        static_cast<CellWidget*>(cell->widget())->announceName();
    if (_rows.path(_focus) != focus)
        announceFocus();
}

void TableWidget::loadIfNeeded() {
    if (!_isLoaded)
        reload();
}

void TableWidget::showEmptyLabel() {
    _emptyLabel->setWanted(_isLoaded && _rows.total() == 0);
}

int TableWidget::rowHeight() const {
    const double text = QFontMetricsF(toQt(Font::systemFontOfSize(15))).height();
    return static_cast<int>(std::max(44.0, std::ceil(text) + 20));
}

QRect TableWidget::rowRect(std::size_t row) const {
    const auto top = static_cast<long long>(row) * rowHeight() - verticalScrollBar()->value();
    return {0, static_cast<int>(top), viewport()->width(), rowHeight()};
}

std::optional<std::size_t> TableWidget::rowAt(const QPoint& place) const {
    const int y = place.y() + verticalScrollBar()->value();
    if (!viewport()->rect().contains(place) || y < 0)
        return std::nullopt;
    const auto row = static_cast<std::size_t>(y / rowHeight());
    return row < _rows.total() ? std::optional(row) : std::nullopt;
}

std::size_t TableWidget::rowsPerPage() const {
    return static_cast<std::size_t>(std::max(viewport()->height() / rowHeight(), 1));
}

void TableWidget::setSelectedRow(std::optional<std::size_t> row) {
    _selected = row && *row < _rows.total() ? row : std::nullopt;
    updateMarks();
}

void TableWidget::setPressedRow(std::optional<std::size_t> row) {
    _pressed = row;
    updateMarks();
}

void TableWidget::setFocusRow(std::optional<std::size_t> row) {
    _focus = row && *row < _rows.total() ? row : std::nullopt;
    if (_focus)
        scrollToRow(*_focus);
    updateMarks();
    announceFocus();
}

void TableWidget::setShowsFocus(bool shows) {
    _showsFocus = shows;
    updateMarks();
}

void TableWidget::scrollToRow(std::size_t row) {
    const QRect rect = rowRect(row);
    QScrollBar* const bar = verticalScrollBar();
    if (rect.top() < 0)
        bar->setValue(bar->value() + rect.top());
    else if (rect.bottom() >= viewport()->height())
        bar->setValue(bar->value() + rect.bottom() + 1 - viewport()->height());
}

void TableWidget::activateRow(std::size_t row) {
    _focus = row;
    setSelectedRow(row);
    if (delegate && view)
        delegate->didSelectRowAtIndexPath(*view, _rows.path(row));
}

void TableWidget::openMenu(std::size_t row, const QPoint& place) {
    const std::vector<MenuItem> items =
        delegate && view ? delegate->menuForRowAtIndexPath(*view, _rows.path(row)) : std::vector<MenuItem>();
    if (items.empty())
        return;
    auto* const menu = new QMenu(this);
    menu->setObjectName("velmora.menu");
    menu->setAttribute(Qt::WA_DeleteOnClose);
    for (const MenuItem& each : items)
        connect(menu->addAction(toQt(each.title)), &QAction::triggered, this, each.action);
    menu->popup(viewport()->mapToGlobal(place));
}

void TableWidget::layoutRows() {
    if (!view || _isLayingOut)
        return;
    _isLayingOut = true;
    const int height = rowHeight();
    const int offset = verticalScrollBar()->value();
    const auto first = std::min(static_cast<std::size_t>(std::max(offset, 0) / height), _rows.total());
    const int bottom = offset + viewport()->height();
    const auto end =
        std::min(static_cast<std::size_t>(std::max((bottom + height - 1) / height, 0)), _rows.total());
    _cells.show(first, end);
    updateMarks();
    _isLayingOut = false;
}

void TableWidget::updateScrollRange() {
    const auto content = static_cast<long long>(_rows.total()) * rowHeight();
    const long long most = std::clamp(content - viewport()->height(), 0LL, 1LL << 30);
    verticalScrollBar()->setPageStep(viewport()->height());
    verticalScrollBar()->setSingleStep(rowHeight());
    const bool wasLayingOut = std::exchange(_isLayingOut, true); // one layout follows, whatever the bar does
    verticalScrollBar()->setRange(0, static_cast<int>(most));
    _isLayingOut = wasLayingOut;
}

void TableWidget::updateMarks() {
    for (const auto& [row, cell] : _cells.all()) {
        if (!cell) // being made
            continue;
        auto* const widget = static_cast<CellWidget*>(cell->widget());
        widget->setSelected(_selected == row);
        widget->setPressed(_pressed == row);
        widget->setFocusFrame(_focus == row && _showsFocus && hasFocus());
    }
}

void TableWidget::announceFocus() {
    CellWidget* const widget = _cells.widget(_focus);
    if (widget && hasFocus())
        announce(*widget, QAccessible::Focus);
}

void TableWidget::resizeEvent(QResizeEvent* event) {
    QAbstractScrollArea::resizeEvent(event);
    updateScrollRange();
    layoutRows();
    showEmptyLabel();
    // An on-screen keyboard, say, has taken the room in which it was.
    if (_focus && _showsFocus && hasFocus() && event->size().height() < event->oldSize().height())
        scrollToRow(*_focus);
}

void TableWidget::showEvent(QShowEvent* event) {
    QAbstractScrollArea::showEvent(event);
    loadIfNeeded();
}

void TableWidget::scrollContentsBy(int /*dx*/, int /*dy*/) {
    layoutRows();
}

bool TableWidget::viewportEvent(QEvent* event) {
    return _input.handle(event) || QAbstractScrollArea::viewportEvent(event);
}

void TableWidget::keyPressEvent(QKeyEvent* event) {
    _input.handleKey(event);
}

void TableWidget::contextMenuEvent(QContextMenuEvent* event) {
    event->setAccepted(_input.openMenu(*event));
}

void TableWidget::focusInEvent(QFocusEvent* event) {
    if (!_focus && _rows.total() > 0)
        _focus = rowAt({0, rowHeight() - 1}).value_or(0);
    if (event->reason() == Qt::TabFocusReason || event->reason() == Qt::BacktabFocusReason)
        _showsFocus = true;
    updateMarks();
    announceFocus();
}

void TableWidget::focusOutEvent(QFocusEvent* /*event*/) {
    updateMarks();
}

void TableWidget::changeEvent(QEvent* event) {
    QAbstractScrollArea::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange) {
        updateScrollRange();
        layoutRows();
    }
}

} // namespace velmora
