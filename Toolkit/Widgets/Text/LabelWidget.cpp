// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Text/LabelWidget.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Tables/CellWidget.h"
#include "Toolkit/Widgets/Text/TextLines.h"

#include <QFontMetricsF>
#include <QPainter>
#include <QStyle>

#include <algorithm>
#include <cmath>

namespace velmora {

LabelWidget::LabelWidget() {
    setTextFormat(Qt::PlainText); // what a modem reports is never markup
    setAlignment(Qt::AlignLeft | Qt::AlignVCenter);
}

void LabelWidget::setTextColor(Color color) {
    if (color == _color)
        return;
    _color = color;
    update();
}

void LabelWidget::setElideMode(Qt::TextElideMode mode) {
    _elideMode = mode;
    update();
}

void LabelWidget::setMaximumLines(int lines) {
    _maximumLines = lines;
    update();
}

int LabelWidget::heightForWidth(int width) const {
    const qsizetype lines = linesOfText(escapedLine(text()), font(), width, _maximumLines, _elideMode).size();
    return static_cast<int>(
        std::ceil(static_cast<double>(std::max<qsizetype>(lines, 1)) * QFontMetricsF(font()).height()));
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
    return linesOfText(escapedLine(text()), font(), width(), _maximumLines, _elideMode).join(u'\n');
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
    const QStringList lines = shownText().split(u'\n');
    // The layout decides about the side, the text about the order: what the modem reports is not turned
    // around.
    const bool isTurned = text().isRightToLeft();
    const int place = static_cast<int>(QStyle::visualAlignment(layoutDirection(), alignment())) |
                      static_cast<int>(Qt::AlignAbsolute) | Qt::TextSingleLine |
                      (isTurned ? Qt::TextForceRightToLeft : Qt::TextForceLeftToRight);
    if (lines.size() == 1) {
        painter.drawText(rect(), place, lines.front());
        return;
    }
    const double line = QFontMetricsF(font()).height();
    double top = (height() - line * static_cast<double>(lines.size())) / 2;
    for (const QString& each : lines) {
        painter.drawText(QRectF(0, top, width(), line), place, each);
        top += line;
    }
}

} // namespace velmora
