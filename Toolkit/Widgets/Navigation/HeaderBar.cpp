// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Navigation/HeaderBar.h"

#include "Toolkit/Widgets/Conversions.h"

#include <QFontMetricsF>
#include <QKeyEvent>
#include <QPainter>
#include <QPainterPath>
#include <QStyle>
#include <QStyleOptionFocusRect>

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

constexpr int chevronWidth = 22;
constexpr int leastHeight = 52;

} // namespace

BackButton::BackButton(QWidget* parent) : QAbstractButton(parent) {
    setObjectName("velmora.back");
    setFont(toQt(Font::systemFontOfSize(15)));
    setFocusPolicy(Qt::TabFocus);
    setAttribute(Qt::WA_Hover);
}

QSize BackButton::sizeHint() const {
    const double advance = QFontMetricsF(font()).horizontalAdvance(escapedLine(text()));
    return {std::max(static_cast<int>(std::ceil(advance)) + chevronWidth + 8, 44), 44};
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
    if (hasFocus()) {
        QStyleOptionFocusRect option;
        option.initFrom(this);
        option.backgroundColor = palette().color(QPalette::Window);
        option.state |= QStyle::State_KeyboardFocusChange;
        style()->drawPrimitive(QStyle::PE_FrameFocusRect, &option, &painter, this);
    }
}

void BackButton::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)
        click();
    else
        QAbstractButton::keyPressEvent(event);
}

HeaderButton::HeaderButton(QWidget* parent) : QAbstractButton(parent) {
    setObjectName("velmora.headerButton");
    setFont(toQt(Font::systemFontOfSize(15)));
    setFocusPolicy(Qt::TabFocus);
    setAttribute(Qt::WA_Hover);
}

QSize HeaderButton::sizeHint() const {
    const double advance = QFontMetricsF(font()).horizontalAdvance(text());
    return {std::max(static_cast<int>(std::ceil(advance)) + 20, 44), 44};
}

void HeaderButton::paintEvent(QPaintEvent* /*event*/) {
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
    if (hasFocus()) {
        QStyleOptionFocusRect option;
        option.initFrom(this);
        option.backgroundColor = palette().color(QPalette::Window);
        option.state |= QStyle::State_KeyboardFocusChange;
        style()->drawPrimitive(QStyle::PE_FrameFocusRect, &option, &painter, this);
    }
}

void HeaderButton::keyPressEvent(QKeyEvent* event) {
    if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)
        click();
    else
        QAbstractButton::keyPressEvent(event);
}

HeaderBar::HeaderBar()
    : _back(new BackButton(this)), _command(new HeaderButton(this)), _title(new HeadingLabel) {
    setObjectName("velmora.header");
    setAutoFillBackground(true);
    _title->setParent(this);
    _title->setObjectName("velmora.title");
    _title->setFont(toQt(Font::boldSystemFontOfSize(17)));
    _title->setAlignment(Qt::AlignCenter);
    _title->setElideMode(Qt::ElideMiddle);
    _title->setMaximumLines(2);
    _title->setHeading(true);
    _back->hide();
    _command->hide();
}

void HeaderBar::setCommand(const QString& title) {
    _command->setText(title);
    _command->setAccessibleName(title);
    _command->setVisible(!title.isEmpty());
    layoutParts();
}

void HeaderBar::setTitle(const QString& title) {
    _title->setText(title);
    _title->setAccessibleName(title);
    layoutParts();
}

void HeaderBar::setBack(bool isShown, const QString& title) {
    _back->setText(title);
    _back->setAccessibleName(title.isEmpty() ? tr("Back") : tr("Back to %1").arg(title));
    _back->setVisible(isShown);
    layoutParts();
}

int HeaderBar::fitWidth(int width) {
    resize(width, height());
    layoutParts();
    return std::max(leastHeight, _title->heightForWidth(_title->width()) + 8);
}

void HeaderBar::layoutParts() {
    // The way back has a third of the bar at most. The title is in the bar's middle when it fits there,
    // beside the way back otherwise.
    const int back = _back->isHidden() ? 0 : std::min(_back->sizeHint().width(), std::max(width() / 3, 44));
    _back->setGeometry(4, (height() - 44) / 2, back, 44);
    const int command = _command->isHidden() ? 0 : std::min(_command->sizeHint().width(), width() / 3);
    _command->setGeometry(width() - command - 8, (height() - 44) / 2, command, 44);
    const int left = back > 0 ? back + 12 : 12;
    const int right = command > 0 ? command + 16 : 12;
    const int wanted = _title->sizeHint().width();
    const int room = std::max(width() - left - right, 0);
    const int middle = (width() - wanted) / 2;
    const bool fits = middle >= std::max(left, right);
    _title->setGeometry(fits ? middle : left, 0, fits ? wanted : room, height());
    for (QWidget* const part : findChildren<QWidget*>(Qt::FindDirectChildrenOnly))
        part->setGeometry(QStyle::visualRect(layoutDirection(), rect(), part->geometry()));
}

void HeaderBar::paintEvent(QPaintEvent* /*event*/) {
    QColor line = palette().color(QPalette::WindowText);
    line.setAlphaF(0.22F);
    const double hair = 1 / devicePixelRatioF();
    QPainter(this).fillRect(QRectF(0, height() - hair, width(), hair), line);
}

void HeaderBar::resizeEvent(QResizeEvent* /*event*/) {
    layoutParts();
}

void HeaderBar::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LayoutDirectionChange)
        layoutParts();
}

} // namespace velmora
