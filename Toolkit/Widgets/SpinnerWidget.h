// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QBasicTimer>
#include <QWidget>

namespace velmora {

/// A wheel of spokes that turns while it spins and is on the screen, and has no timer otherwise.
class SpinnerWidget : public QWidget {
public:
    SpinnerWidget();

    void setSpinning(bool spins);
    [[nodiscard]] bool isSpinning() const { return _isSpinning; }
    /// Whether it turns right now.
    [[nodiscard]] bool isTurning() const { return _timer.isActive(); }

protected:
    void timerEvent(QTimerEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    void updateTimer(bool isShown);

    QBasicTimer _timer;
    bool _isSpinning = false;
    int _step = 0;
};

} // namespace velmora
