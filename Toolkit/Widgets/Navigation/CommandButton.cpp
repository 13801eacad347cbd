// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Navigation/CommandButton.h"

#include <QFontMetricsF>
#include <QPainter>

namespace velmora {

CommandButton::CommandButton(QWidget* parent)
    : HeaderButton(parent, QStringLiteral("velmora.headerButton")) {}

QSize CommandButton::sizeHint() const {
    constexpr int margins = 20;
    return sizeOfWidth(QFontMetricsF(font()).horizontalAdvance(text()) + margins);
}

void CommandButton::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    const QColor ink = palette().color(QPalette::WindowText);
    QColor ground = ink;
    ground.setAlphaF(isDown() ? 0.2F : underMouse() ? 0.14F : isChecked() ? 0.12F : 0.06F);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    painter.setBrush(ground);
    painter.drawRoundedRect(QRectF(rect()).adjusted(0, 6, 0, -6), 6, 6);
    painter.setPen(ink);
    painter.drawText(rect(), static_cast<int>(Qt::AlignCenter) | Qt::TextSingleLine,
                     QFontMetricsF(font()).elidedText(text(), Qt::ElideRight, width()));
    paintFocus(painter);
}

} // namespace velmora
