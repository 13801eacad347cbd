// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QAbstractButton>

class QPainter;

namespace velmora {

/// A button of the header. Enter presses it, as Space does.
class HeaderButton : public QAbstractButton {
protected:
    HeaderButton(QWidget* parent, const QString& objectName);

    /// Of that width, and of the least that a finger hits.
    [[nodiscard]] static QSize sizeOfWidth(double width);
    /// Draws the frame of the keyboard's focus, if the button has it.
    void paintFocus(QPainter& painter);
    void keyPressEvent(QKeyEvent* event) override;
};

} // namespace velmora
