// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Navigation/BackButton.h"

#include "Toolkit/Widgets/Conversions.h"

#include <QFontMetricsF>
#include <QPainter>
#include <QPainterPath>
#include <QStyle>

namespace velmora {

namespace {

constexpr int chevronWidth = 22;

} // namespace

BackButton::BackButton(QWidget* parent) : HeaderButton(parent, QStringLiteral("velmora.back")) {}

QSize BackButton::sizeHint() const {
    constexpr int margins = 8;
    return sizeOfWidth(QFontMetricsF(font()).horizontalAdvance(escapedLine(text())) + chevronWidth + margins);
}

void BackButton::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    QColor ink = palette().color(QPalette::WindowText);
    if (isDown() || underMouse()) {
        QColor ground = ink;
        ground.setAlphaF(isDown() ? 0.16F : 0.08F);
        painter.fillRect(rect(), ground);
    }
    const double middle = height() / 2.0;
    const bool isMirrored = isRightToLeft();
    const auto x = [&](double left) { return isMirrored ? width() - left : left; };
    QPainterPath chevron;
    chevron.moveTo(x(14), middle - 7);
    chevron.lineTo(x(7), middle);
    chevron.lineTo(x(14), middle + 7);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(QPen(ink, 2, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.drawPath(chevron);
    painter.setPen(ink);
    const QRect room = QStyle::visualRect(layoutDirection(), rect(), rect().adjusted(chevronWidth, 0, -4, 0));
    const Qt::Alignment side = isMirrored ? Qt::AlignRight : Qt::AlignLeft;
    painter.drawText(room,
                     static_cast<int>(side | Qt::AlignAbsolute | Qt::AlignVCenter) | Qt::TextSingleLine |
                         (text().isRightToLeft() ? Qt::TextForceRightToLeft : Qt::TextForceLeftToRight),
                     QFontMetricsF(font()).elidedText(escapedLine(text()), Qt::ElideRight, room.width()));
    paintFocus(painter);
}

} // namespace velmora
