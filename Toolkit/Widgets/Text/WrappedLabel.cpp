// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Text/WrappedLabel.h"

#include <QPainter>
#include <QStyle>
#include <QTextLayout>

#include <algorithm>
#include <cmath>

namespace velmora {

WrappedLabel::WrappedLabel() {
    setTextFormat(Qt::PlainText);
}

QString WrappedLabel::brokenText() const {
    const QString wordJoiner(QChar(0x2060));
    return text().replace(QStringLiteral("--"), "-" + wordJoiner + "-" + wordJoiner);
}

double WrappedLabel::breakLines(QTextLayout& layout, int width) const {
    QTextOption option;
    option.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
    option.setTextDirection(text().isRightToLeft() ? Qt::RightToLeft : Qt::LeftToRight);
    option.setAlignment(QStyle::visualAlignment(layoutDirection(), alignment()) | Qt::AlignAbsolute);
    layout.setTextOption(option);
    layout.beginLayout();
    double height = 0;
    for (QTextLine line = layout.createLine(); line.isValid(); line = layout.createLine()) {
        line.setLineWidth(std::max(width, 1));
        line.setPosition({0, height});
        height += line.height();
    }
    layout.endLayout();
    return height;
}

int WrappedLabel::heightForWidth(int width) const {
    QTextLayout layout(brokenText(), font());
    return static_cast<int>(std::ceil(breakLines(layout, width)));
}

void WrappedLabel::paintEvent(QPaintEvent* /*event*/) {
    QPainter painter(this);
    painter.setPen(palette().color(QPalette::WindowText));
    QTextLayout layout(brokenText(), font());
    const double height = breakLines(layout, width());
    layout.draw(&painter, {0, std::max((this->height() - height) / 2, 0.0)});
}

} // namespace velmora
