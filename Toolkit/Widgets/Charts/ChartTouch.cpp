// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Strokes of the mouse and of fingers: what is tapped, dragged, pinched or scrolled.

#include "Toolkit/Widgets/Charts/ChartInput.h"
#include "Toolkit/Widgets/Charts/ChartWidget.h"
#include "Toolkit/Widgets/TouchEvent.h"

#include <QAbstractScrollArea>
#include <QApplication>
#include <QNativeGestureEvent>
#include <QScrollBar>
#include <QTouchEvent>

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

/// How far from a sample a tap still means it, in points.
constexpr double reach = 12;

} // namespace

bool ChartInput::handle(QEvent* event) {
    if (const QTouchEvent* const fingers = touchEvent(event)) {
        touch(*fingers);
        event->accept();
        return true;
    }
    if (event->type() != QEvent::NativeGesture)
        return false;
    const auto* const gesture = static_cast<QNativeGestureEvent*>(event);
    if (gesture->gestureType() != Qt::ZoomNativeGesture)
        return false;
    zoom(1 / std::max(1 + gesture->value(), 0.1), gesture->position().x());
    return true;
}

void ChartInput::touch(const QTouchEvent& event) {
    if (event.type() == QEvent::TouchCancel || event.points().isEmpty()) {
        _stroke = Stroke::none;
        return;
    }
    const QPointF place = event.points().first().position();
    if (event.points().size() > 1 && event.type() != QEvent::TouchEnd) {
        pinch(place, event.points().at(1).position());
    } else if (event.type() == QEvent::TouchBegin) {
        _chart.setFocus(Qt::MouseFocusReason);
        press(place);
    } else if (event.type() == QEvent::TouchEnd) {
        release(place);
    } else if (_stroke == Stroke::pinch) {
        // One of two fingers is up: the other goes on as a drag.
        _stroke = Stroke::pan;
        _last = place;
    } else {
        move(place, true);
    }
}

void ChartInput::press(const QPointF& place) {
    _stroke = Stroke::undecided;
    _start = place;
    _last = place;
}

void ChartInput::move(const QPointF& place, bool isFinger) {
    if (_stroke == Stroke::undecided) {
        const QPointF way = place - _start;
        if (way.manhattanLength() < QApplication::startDragDistance())
            return;
        _stroke = isFinger && std::abs(way.y()) > std::abs(way.x()) ? Stroke::scroll : Stroke::pan;
    }
    const QPointF step = place - _last;
    if (_stroke == Stroke::pan)
        pan(step.x());
    else if (_stroke == Stroke::scroll)
        scroll(step.y());
    _last = place;
}

void ChartInput::release(const QPointF& place) {
    const bool isTap = _stroke == Stroke::undecided;
    _stroke = Stroke::none;
    if (!isTap)
        return;
    const ChartScale scale = _chart.scale();
    const double x = std::clamp(place.x(), scale.left, scale.left + scale.width());
    const std::int64_t time_ns = scale.timeAt(x);
    _chart.moveCursor(_chart.model.nearest(time_ns, scale.timeOf(reach)).value_or(time_ns));
}

void ChartInput::pinch(const QPointF& one, const QPointF& other) {
    const double spread = std::max(std::hypot(one.x() - other.x(), one.y() - other.y()), 10.0);
    const QPointF middle = (one + other) / 2;
    if (_stroke == Stroke::pinch) {
        pan(middle.x() - _last.x());
        zoom(_spread / spread, middle.x());
    }
    _stroke = Stroke::pinch;
    _spread = spread;
    _last = middle;
}

void ChartInput::scroll(double points) {
    for (QWidget* outer = _chart.parentWidget(); outer; outer = outer->parentWidget())
        if (auto* const area = qobject_cast<QAbstractScrollArea*>(outer)) {
            QScrollBar* const bar = area->verticalScrollBar();
            bar->setValue(bar->value() - static_cast<int>(std::lround(points)));
            return;
        }
}

} // namespace velmora
