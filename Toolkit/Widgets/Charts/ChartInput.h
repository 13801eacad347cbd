// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QPointF>
#include <QPointer>

#include <cstdint>
#include <optional>

class QAbstractScrollArea;
class QEvent;
class QKeyEvent;
class QMouseEvent;
class QTouchEvent;
class QWheelEvent;

namespace velmora {

class ChartWidget;

/// Keys, wheel, mouse and fingers of a chart.
class ChartInput {
public:
    explicit ChartInput(ChartWidget& chart);

    /// Touch and touchpad gestures; true when it was used.
    [[nodiscard]] bool handle(QEvent* event);
    void handleKey(QKeyEvent* event);
    void handleWheel(QWheelEvent* event);
    void handleMouse(QMouseEvent* event);

private:
    /// What the finger or button that is down does.
    enum class Stroke { none, undecided, pan, scroll, pinch };

    void touch(const QTouchEvent& event);
    void press(const QPointF& place);
    void move(const QPointF& place, bool isFinger);
    void release(const QPointF& place);
    void pinch(const QPointF& one, const QPointF& other);
    void pan(double points);
    /// Scrolls what the chart lies in.
    void scroll(double points);
    void zoom(double factor, double x);
    void zoomByKey(double factor);
    void chooseSpan(std::optional<std::int64_t> span_ns);
    void goToOldest();
    [[nodiscard]] bool handleCommand(int key);

    ChartWidget& _chart;
    Stroke _stroke = Stroke::none;
    QPointF _start;
    QPointF _last;
    double _spread = 0; ///< between two fingers
};

} // namespace velmora
