// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/LabelWidget.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"

#include <QFontMetricsF>
#include <QPainter>

#include <cmath>

namespace velmora {

LabelWidget::LabelWidget() {
    setTextFormat(Qt::PlainText); // what a modem reports is never markup
    setAlignment(Qt::AlignLeft | Qt::AlignVCenter);
}

void LabelWidget::setTextColor(Color color) {
    _color = color;
    update();
}

void LabelWidget::setElideMode(Qt::TextElideMode mode) {
    _elideMode = mode;
    update();
}

QSize LabelWidget::sizeHint() const {
    const QFontMetricsF metrics(font());
    return {static_cast<int>(std::ceil(metrics.horizontalAdvance(escapedLine(text())))),
            static_cast<int>(std::ceil(metrics.height()))};
}

QSize LabelWidget::minimumSizeHint() const {
    return {0, sizeHint().height()};
}

QString LabelWidget::shownText() const {
    const QFontMetricsF metrics(font());
    const QString whole = escapedLine(text());
    return metrics.horizontalAdvance(whole) <= width() ? whole
                                                       : metrics.elidedText(whole, _elideMode, width());
}

QColor LabelWidget::shownColor() const {
    if (_color == Color::clear)
        return Qt::transparent;
    const bool isOnHighlight = _color == Color::automatic && CellWidget::isOnHighlight(*this);
    return isOnHighlight ? palette().color(QPalette::HighlightedText)
                         : colorOf(_color, palette(), QPalette::WindowText);
}

void LabelWidget::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    painter.setPen(shownColor());
    painter.drawText(rect(), static_cast<int>(alignment()) | Qt::TextSingleLine, shownText());
}

} // namespace velmora
