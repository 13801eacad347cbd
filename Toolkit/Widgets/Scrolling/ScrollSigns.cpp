// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Scrolling/ScrollSigns.h"

#include "Toolkit/Widgets/Contrast.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"

#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>

namespace velmora {

namespace {

constexpr double signWidth = 16;
constexpr double fadeWidth = 24;

} // namespace

ScrollSigns::ScrollSigns(QWidget& parent, const QWidget& content) : QWidget(&parent), _content(content) {
    setObjectName("velmora.scrollSigns");
    setAttribute(Qt::WA_TransparentForMouseEvents);
}

bool ScrollSigns::goesOnAtLeft() const {
    return _content.childrenRect().left() + _content.x() < 0;
}

bool ScrollSigns::goesOnAtRight() const {
    return _content.childrenRect().right() + _content.x() >= width();
}

QColor ScrollSigns::ground() const {
    return palette().color(CellWidget::isOnHighlight(*this) ? QPalette::Highlight : QPalette::Base);
}

void ScrollSigns::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    painter.setRenderHint(QPainter::Antialiasing);
    const QColor solid = ground();
    QColor clear = solid;
    clear.setAlpha(0);
    const QColor ink =
        CellWidget::isOnHighlight(*this)
            ? palette().color(QPalette::HighlightedText)
            : markColor(palette().color(QPalette::PlaceholderText), solid, palette().color(QPalette::Text));
    // Drawn for the right edge.
    const auto drawSign = [&] {
        const double edge = width() - signWidth;
        QLinearGradient fade(edge - fadeWidth, 0, edge, 0);
        fade.setColorAt(0, clear);
        fade.setColorAt(1, solid);
        painter.fillRect(QRectF(edge - fadeWidth, 0, fadeWidth, height()), fade);
        painter.fillRect(QRectF(edge, 0, signWidth, height()), solid);
        QPainterPath chevron;
        chevron.moveTo(edge + 5, height() / 2.0 - 5);
        chevron.lineTo(edge + 10, height() / 2.0);
        chevron.lineTo(edge + 5, height() / 2.0 + 5);
        painter.setPen(QPen(ink, 2, Qt::DotLine, Qt::RoundCap, Qt::RoundJoin));
        painter.drawPath(chevron);
    };
    if (goesOnAtRight())
        drawSign();
    if (goesOnAtLeft()) {
        painter.translate(width(), 0);
        painter.scale(-1, 1);
        drawSign();
    }
}

} // namespace velmora
