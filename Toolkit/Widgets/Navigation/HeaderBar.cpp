// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Navigation/HeaderBar.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Navigation/BackButton.h"
#include "Toolkit/Widgets/Navigation/CommandButton.h"
#include "Toolkit/Widgets/Text/LabelWidget.h"

#include <QEvent>
#include <QPainter>
#include <QStyle>

#include <algorithm>

namespace velmora {

namespace {

constexpr int leastHeight = 52;

} // namespace

HeaderBar::HeaderBar()
    : _back(new BackButton(this)), _command(new CommandButton(this)), _title(new LabelWidget) {
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
