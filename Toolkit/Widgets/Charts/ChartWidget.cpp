// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/ChartWidget.h"

#include "Toolkit/Widgets/Accessibility.h"
#include "Toolkit/Widgets/Charts/ChartPainter.h"
#include "Toolkit/Widgets/Charts/ChartTableWidget.h"
#include "Toolkit/Widgets/Conversions.h"

#include <QEvent>
#include <QPainter>
#include <QStyleOptionFocusRect>

#include <utility>

namespace velmora {

namespace {

constexpr std::size_t tableRows = 500;

} // namespace

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
    if (!isVisible() || !model.window.isFollowing())
        return;
    // In a long range time passes without moving it by a pixel, but a value may have become too old to count.
    if (scale() != _shown || readingSamples() != _shownSamples)
        showChanges();
}

std::vector<std::optional<Sample>> ChartWidget::readingSamples() const {
    std::vector<std::optional<Sample>> samples;
    const std::int64_t time_ns = model.readingTime_ns();
    for (const auto& [id, panel] : model.panels())
        for (const ChartSeries& series : panel.series)
            samples.push_back(series.samples ? series.samples->at(time_ns) : std::nullopt);
    return samples;
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
        _table = new ChartTableWidget(this);
        _table->onClose = [this] { setShowsTable(false); };
        _table->onChoose = [this](std::int64_t time_ns) {
            setShowsTable(false);
            moveCursor(time_ns);
        };
    }
    _table->forgetChoice();
    _table->setGeometry(rect());
    _table->setVisible(shows);
    if (shows) {
        fillTable();
        _table->scrollToItem(_table->currentItem());
    }
    if (hadFocus)
        (shows ? static_cast<QWidget*>(_table) : this)->setFocus();
    update();
}

void ChartWidget::fillTable() {
    _table->setAccessibleName(accessibleName().isEmpty() ? tr("Values")
                                                         : tr("Values, %1").arg(accessibleName()));
    _table->fill(model.table(tableRows), model.readingTime_ns());
    noteShown();
}

void ChartWidget::noteShown() {
    _shown = scale();
    _shownSamples = readingSamples();
    (void)model.takeChanges(_shown.range());
}

void ChartWidget::showEvent(QShowEvent* /*event*/) {
    if (showsTable())
        fillTable(); // which was left as it was while hidden
}

void ChartWidget::paintEvent(QPaintEvent* /*event*/) {
    ++_paintCount;
    QPainter painter(this);
    const ChartTheme theme(palette());
    painter.fillRect(rect(), theme.ground());
    const ChartLayout layout(model, size(), font(), isRightToLeft());
    noteShown();
    painter.setFont(font());
    ChartPainter(painter, model, layout, _shown, theme).draw();
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
