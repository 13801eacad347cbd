// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/SpinnerWidget.h"

#include "Toolkit/Widgets/Animation.h"

#include <QPainter>

#include <algorithm>

namespace velmora {

namespace {

constexpr int side = 20;
constexpr int spokes = 12;
constexpr int step_ms = 90;

} // namespace

SpinnerWidget::SpinnerWidget() {
    setObjectName("velmora.busy");
    setAccessibleName(tr("Busy"));
    setFixedSize(side, side);
}

void SpinnerWidget::setSpinning(bool spins) {
    _isSpinning = spins;
    updateTimer(isVisible());
    update();
}

void SpinnerWidget::updateTimer(bool isShown) {
    const bool turns = _isSpinning && isShown && animationsEnabled();
    if (turns && !_timer.isActive())
        _timer.start(step_ms, this);
    else if (!turns)
        _timer.stop();
}

void SpinnerWidget::timerEvent(QTimerEvent* /*event*/) {
    _step = (_step + 1) % spokes;
    update();
}

void SpinnerWidget::showEvent(QShowEvent* /*event*/) {
    updateTimer(true);
}

void SpinnerWidget::hideEvent(QHideEvent* /*event*/) {
    updateTimer(false);
}

void SpinnerWidget::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(width() / 2.0, height() / 2.0);
    QColor gray = palette().color(QPalette::WindowText);
    for (int spoke = 0; spoke < spokes; ++spoke) {
        // The spoke at the step is the strongest, those before it fade out.
        const int age = (_step - spoke + spokes) % spokes;
        gray.setAlphaF(0.65F * static_cast<float>(std::max(spokes - age, 3)) / spokes);
        painter.save();
        painter.rotate(360.0 * spoke / spokes);
        painter.setPen(QPen(gray, 2, Qt::SolidLine, Qt::RoundCap));
        painter.drawLine(QPointF(0, -5), QPointF(0, -8.5));
        painter.restore();
    }
}

} // namespace velmora
