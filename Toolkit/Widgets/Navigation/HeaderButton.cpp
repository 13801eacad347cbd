// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Navigation/HeaderButton.h"

#include "Toolkit/Widgets/Conversions.h"

#include <QKeyEvent>
#include <QPainter>
#include <QStyle>
#include <QStyleOptionFocusRect>

#include <algorithm>
#include <cmath>

namespace velmora {

HeaderButton::HeaderButton(QWidget* parent, const QString& objectName) : QAbstractButton(parent) {
    setObjectName(objectName);
    setFont(toQt(Font::systemFontOfSize(15)));
    setFocusPolicy(Qt::TabFocus);
    setAttribute(Qt::WA_Hover);
}

QSize HeaderButton::sizeOfWidth(double width) {
    constexpr int leastSize = 44;
    return {std::max(static_cast<int>(std::ceil(width)), leastSize), leastSize};
}

void HeaderButton::paintFocus(QPainter& painter) {
    if (!hasFocus())
        return;
    QStyleOptionFocusRect option;
    option.initFrom(this);
    option.backgroundColor = palette().color(QPalette::Window);
    option.state |= QStyle::State_KeyboardFocusChange;
    style()->drawPrimitive(QStyle::PE_FrameFocusRect, &option, &painter, this);
}

void HeaderButton::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)
        click();
    else
        QAbstractButton::keyPressEvent(event);
}

} // namespace velmora
