// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/ChartInput.h"

#include "Toolkit/Widgets/Charts/ChartWidget.h"

#include <QKeyEvent>
#include <QMouseEvent>
#include <QNativeGestureEvent>
#include <QTouchEvent>
#include <QWheelEvent>

#include <cmath>

namespace velmora {

namespace {

constexpr double zoomStep = 1.5;
constexpr int longStep = 10;

} // namespace

ChartInput::ChartInput(ChartWidget& chart) : _chart(chart) {}

void ChartInput::zoom(double factor, double x) {
    const std::int64_t fixed_ns = _chart.scale().timeAt(x);
    _chart.changeWindow([&](TimeWindow& window) { window.zoom(factor, fixed_ns, _chart.model.oldest_ns()); });
}

void ChartInput::zoomByKey(double factor) {
    const TimeRange shown = _chart.model.range();
    const std::int64_t fixed_ns = _chart.model.cursor_ns.value_or(shown.begin_ns + shown.length_ns() / 2);
    _chart.changeWindow([&](TimeWindow& window) { window.zoom(factor, fixed_ns, _chart.model.oldest_ns()); });
}

void ChartInput::pan(double points) {
    const std::int64_t by_ns = -_chart.scale().timeOf(points);
    _chart.changeWindow([&](TimeWindow& window) { window.pan(by_ns, _chart.model.oldest_ns()); });
}

void ChartInput::chooseSpan(std::optional<std::int64_t> span_ns) {
    _chart.changeWindow([&](TimeWindow& window) { window.setSpan(span_ns); });
}

void ChartInput::goToOldest() {
    if (const auto oldest_ns = _chart.model.oldest_ns())
        _chart.moveCursor(oldest_ns);
}

void ChartInput::handleKey(QKeyEvent* event) {
    event->accept();
    const bool isLong = event->modifiers() & Qt::ShiftModifier;
    if (event->modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier)) {
        event->ignore();
        return;
    }
    // Time runs to the right in charts of every language, so the arrows are not mirrored.
    switch (event->key()) {
    case Qt::Key_Left: _chart.stepCursor(isLong ? -longStep : -1); break;
    case Qt::Key_Right: _chart.stepCursor(isLong ? longStep : 1); break;
    case Qt::Key_PageUp: pan(_chart.scale().width() / 2); break;
    case Qt::Key_PageDown: pan(-_chart.scale().width() / 2); break;
    case Qt::Key_Escape:
        // Without a cursor it is for what the chart lies in.
        event->setAccepted(_chart.model.cursor_ns.has_value());
        _chart.moveCursor(std::nullopt);
        break;
    default: event->setAccepted(handleCommand(event->key())); break;
    }
}

bool ChartInput::handleCommand(int key) {
    constexpr std::int64_t minute_ns = 60 * TimeWindow::second_ns;
    switch (key) {
    case Qt::Key_Plus:
    case Qt::Key_Equal: zoomByKey(1 / zoomStep); return true;
    case Qt::Key_Minus: zoomByKey(zoomStep); return true;
    case Qt::Key_Home: goToOldest(); return true;
    case Qt::Key_End:
    case Qt::Key_N:
        _chart.moveCursor(std::nullopt);
        _chart.changeWindow([](TimeWindow& window) { window.follow(); });
        return true;
    case Qt::Key_1: chooseSpan(minute_ns); return true;
    case Qt::Key_5: chooseSpan(5 * minute_ns); return true;
    case Qt::Key_3: chooseSpan(30 * minute_ns); return true;
    case Qt::Key_A: chooseSpan(std::nullopt); return true;
    case Qt::Key_T: _chart.setShowsTable(true); return true;
    default: return false;
    }
}

void ChartInput::handleWheel(QWheelEvent* event) {
    const QPoint angle = event->angleDelta();
    const bool isSideways = std::abs(angle.x()) > std::abs(angle.y());
    const bool isShifted = event->modifiers() & Qt::ShiftModifier;
    if (isSideways || isShifted) {
        const QPoint turn = event->pixelDelta().isNull() ? angle : event->pixelDelta();
        pan(isSideways ? turn.x() : turn.y());
    } else if (angle.y() != 0) {
        zoom(std::pow(zoomStep, -angle.y() / 120.0), event->position().x());
    }
    event->accept();
}

void ChartInput::handleMouse(QMouseEvent* event) {
    // A finger arrives as touch events; those made of them are for widgets that have no use for these.
    if (event->source() != Qt::MouseEventNotSynthesized)
        return;
    if (event->type() == QEvent::MouseMove) {
        move(event->position(), false);
    } else if (event->button() == Qt::LeftButton) {
        if (event->type() == QEvent::MouseButtonPress)
            press(event->position());
        else
            release(event->position());
    }
}

} // namespace velmora
