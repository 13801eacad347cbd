// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/ChartWidget.h"

#include "Toolkit/Widgets/Accessibility.h"
#include "Toolkit/Widgets/Charts/ChartPainter.h"
#include "Toolkit/Widgets/Conversions.h"

#include <QEvent>
#include <QHeaderView>
#include <QKeyEvent>
#include <QPainter>
#include <QStyleOptionFocusRect>
#include <QTableWidget>

#include <utility>

namespace velmora {

ChartWidget::ChartWidget() {
    setObjectName("velmora.chart");
    setFocusPolicy(Qt::StrongFocus);
    setAttribute(Qt::WA_AcceptTouchEvents);
    setAutoFillBackground(false);
    setAttribute(Qt::WA_OpaquePaintEvent);
}

ChartWidget::~ChartWidget() = default;

ChartScale ChartWidget::scale() const {
    const ChartLayout layout(model, size(), font(), isRightToLeft());
    return ChartScale::covering(model.range(), layout.left(), layout.width(), devicePixelRatioF());
}

double ChartWidget::preferredHeight() const {
    return ChartLayout(model, size(), font(), isRightToLeft()).preferredHeight();
}

void ChartWidget::contentsChanged() {
    showChanges();
}

void ChartWidget::setNow(std::int64_t now_ns) {
    if (now_ns == model.window.now_ns())
        return;
    model.window.setNow(now_ns);
    if (isVisible() && model.window.isFollowing() && scale() != _painted)
        showChanges();
}

void ChartWidget::samplesChanged() {
    if (isVisible() && model.takeChanges(scale().range()))
        showChanges();
}

void ChartWidget::changeWindow(const std::function<void(TimeWindow&)>& change) {
    const TimeRange before = model.range();
    const bool wasFollowing = model.window.isFollowing();
    change(model.window);
    if (model.range() == before && model.window.isFollowing() == wasFollowing)
        return;
    showChanges();
    const std::function<void()> changed = onRangeChanged; // a copy, since the call may destroy the chart
    if (changed)
        changed();
}

void ChartWidget::setCursor(std::optional<std::int64_t> time_ns) {
    if (time_ns)
        changeWindow([&](TimeWindow& window) { window.reveal(*time_ns, model.oldest_ns()); });
    if (std::exchange(model.cursor_ns, time_ns) != time_ns)
        showChanges();
}

void ChartWidget::moveCursor(std::optional<std::int64_t> time_ns) {
    if (time_ns == model.cursor_ns)
        return;
    setCursor(time_ns);
    if (hasAnnouncementListener())
        announce(*this, QAccessible::NameChanged);
    const std::function<void(std::optional<std::int64_t>)> moved = onCursorMoved;
    if (moved)
        moved(time_ns);
}

void ChartWidget::stepCursor(int samples) {
    // Without a cursor the first step back reaches the last sample, even one at the very end.
    const std::int64_t from_ns = model.cursor_ns.value_or(model.range().end_ns + (samples < 0 ? 1 : 0));
    if (const auto reached = model.stepped(from_ns, samples))
        moveCursor(reached);
}

void ChartWidget::showChanges() {
    if (!isVisible())
        return;
    if (showsTable())
        fillTable();
    else
        update();
}

bool ChartWidget::showsTable() const {
    return _table && !_table->isHidden();
}

void ChartWidget::setShowsTable(bool shows) {
    if (shows == showsTable())
        return;
    const bool hadFocus = hasFocus() || (_table && _table->hasFocus());
    if (!_table) {
        _table = new QTableWidget(this);
        _table->setObjectName("velmora.chartTable");
        _table->setEditTriggers(QAbstractItemView::NoEditTriggers);
        _table->setSelectionBehavior(QAbstractItemView::SelectRows);
        _table->setSelectionMode(QAbstractItemView::SingleSelection);
        _table->verticalHeader()->hide();
        _table->installEventFilter(this);
    }
    _table->setGeometry(rect());
    _table->setVisible(shows);
    if (shows)
        fillTable();
    if (hadFocus)
        (shows ? static_cast<QWidget*>(_table) : this)->setFocus();
    update();
}

void ChartWidget::fillTable() {
    const ChartTable table = model.table(500);
    const int row = _table->currentRow();
    const int column = _table->currentColumn();
    _table->setAccessibleName(tr("Values of %1").arg(accessibleName()));
    _table->clear();
    _table->setRowCount(static_cast<int>(table.rows.size()));
    _table->setColumnCount(static_cast<int>(table.columns.size()));
    QStringList titles;
    for (const std::string& title : table.columns)
        titles.push_back(toQt(title));
    _table->setHorizontalHeaderLabels(titles);
    for (std::size_t y = 0; y < table.rows.size(); ++y)
        for (std::size_t x = 0; x < table.rows[y].size(); ++x)
            _table->setItem(static_cast<int>(y), static_cast<int>(x),
                            new QTableWidgetItem(toQt(table.rows[y][x])));
    _table->resizeColumnsToContents();
    if (_table->rowCount() > 0)
        _table->setCurrentCell(std::clamp(row, 0, _table->rowCount() - 1), std::max(column, 0));
}

bool ChartWidget::eventFilter(QObject* watched, QEvent* event) {
    if (watched != _table || event->type() != QEvent::KeyPress)
        return false;
    const int key = static_cast<QKeyEvent*>(event)->key();
    if (key != Qt::Key_T && key != Qt::Key_Escape)
        return false;
    setShowsTable(false);
    return true;
}

void ChartWidget::paintEvent(QPaintEvent* /*event*/) {
    ++_paintCount;
    QPainter painter(this);
    const ChartTheme theme(palette());
    painter.fillRect(rect(), theme.ground());
    const ChartLayout layout(model, size(), font(), isRightToLeft());
    _painted = ChartScale::covering(model.range(), layout.left(), layout.width(), devicePixelRatioF());
    (void)model.takeChanges(_painted.range());
    painter.setFont(font());
    ChartPainter(painter, model, layout, _painted, theme).draw();
    if (hasFocus() && !showsTable()) {
        QStyleOptionFocusRect option;
        option.initFrom(this);
        style()->drawPrimitive(QStyle::PE_FrameFocusRect, &option, &painter, this);
    }
}

bool ChartWidget::event(QEvent* event) {
    return _input.handle(event) || QWidget::event(event);
}

void ChartWidget::keyPressEvent(QKeyEvent* event) {
    _input.handleKey(event);
}

void ChartWidget::wheelEvent(QWheelEvent* event) {
    _input.handleWheel(event);
}

void ChartWidget::mousePressEvent(QMouseEvent* event) {
    _input.handleMouse(event);
}

void ChartWidget::mouseMoveEvent(QMouseEvent* event) {
    _input.handleMouse(event);
}

void ChartWidget::mouseReleaseEvent(QMouseEvent* event) {
    _input.handleMouse(event);
}

void ChartWidget::resizeEvent(QResizeEvent* /*event*/) {
    if (_table)
        _table->setGeometry(rect());
}

void ChartWidget::changeEvent(QEvent* event) {
    if (event->type() == QEvent::FontChange || event->type() == QEvent::PaletteChange ||
        event->type() == QEvent::LayoutDirectionChange)
        update();
    QWidget::changeEvent(event);
}

void ChartWidget::focusInEvent(QFocusEvent* /*event*/) {
    update();
}

void ChartWidget::focusOutEvent(QFocusEvent* /*event*/) {
    update();
}

} // namespace velmora
