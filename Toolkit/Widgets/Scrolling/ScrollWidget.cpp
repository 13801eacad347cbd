// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Scrolling/ScrollWidget.h"

#include "Toolkit/Widgets/Scrolling/ScrollSigns.h"
#include "Toolkit/Widgets/Scrolling/TouchScroll.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"
#include "Toolkit/Widgets/TouchEvent.h"

#include <QScrollEvent>
#include <QScrollPrepareEvent>
#include <QTouchEvent>
#include <QWheelEvent>

#include <algorithm>
#include <cmath>

namespace velmora {

ScrollWidget::ScrollWidget() : _content(new QWidget(this)), _signs(new ScrollSigns(*this, *_content)) {}

void ScrollWidget::setContentSize(const QSizeF& size) {
    _size = size;
    _content->resize(static_cast<int>(std::ceil(std::clamp(size.width(), 0.0, 1e6))),
                     static_cast<int>(std::ceil(std::clamp(size.height(), 0.0, 1e6))));
    setOffset(_offset);
}

void ScrollWidget::setOffset(double x) {
    _offset = std::clamp(x, 0.0, maximumOffset());
    const int moved = static_cast<int>(std::round(_offset));
    _content->move(isRightToLeft() ? width() - _content->width() + moved : -moved, 0);
    _signs->setGeometry(rect());
    _signs->setVisible(maximumOffset() > 0);
    _signs->update();
}

double ScrollWidget::maximumOffset() const {
    return std::max(_size.width() - width(), 0.0);
}

double ScrollWidget::position() const {
    return isRightToLeft() ? maximumOffset() - _offset : _offset;
}

void ScrollWidget::setPosition(double x) {
    setOffset(isRightToLeft() ? maximumOffset() - x : x);
}

ScrollWidget* ScrollWidget::at(const QWidget& ancestor, const QPoint& place) {
    for (QWidget* widget = ancestor.childAt(place); widget && widget != &ancestor;
         widget = widget->parentWidget())
        if (auto* const scroller = dynamic_cast<ScrollWidget*>(widget);
            scroller && scroller->maximumOffset() > 0)
            return scroller;
    return nullptr;
}

bool ScrollWidget::event(QEvent* event) {
    if (event->type() == QEvent::ScrollPrepare && maximumOffset() > 0) {
        auto* const prepare = static_cast<QScrollPrepareEvent*>(event);
        prepare->setViewportSize(size());
        prepare->setContentPosRange({0, 0, maximumOffset(), 0});
        prepare->setContentPos({position(), 0});
        prepare->accept();
        return true;
    }
    if (event->type() == QEvent::Scroll) {
        setPosition(static_cast<QScrollEvent*>(event)->contentPos().x());
        return true;
    }
    const QTouchEvent* const fingers = touchEvent(event);
    if (fingers && testAttribute(Qt::WA_AcceptTouchEvents) && maximumOffset() > 0) {
        (void)scrollByTouch(*this, *fingers);
        event->accept();
        return true;
    }
    return QWidget::event(event);
}

void ScrollWidget::wheelEvent(QWheelEvent* event) {
    // A plain wheel belongs to what scrolls up and down around this; a touchpad's sideways stroke and the
    // wheel with Shift (as which some platforms already report a sideways turn) belong here.
    const QPoint turn = event->pixelDelta().isNull() ? event->angleDelta() : event->pixelDelta();
    const bool isSideways = std::abs(turn.x()) > std::abs(turn.y());
    const int distance = isSideways ? turn.x() : event->modifiers() & Qt::ShiftModifier ? turn.y() : 0;
    if (distance == 0 || maximumOffset() <= 0) {
        event->ignore();
        return;
    }
    setPosition(position() - distance);
    event->accept();
}

void ScrollWidget::resizeEvent(QResizeEvent* /*event*/) {
    setOffset(_offset);
}

void ScrollWidget::changeEvent(QEvent* event) {
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LayoutDirectionChange)
        setOffset(_offset);
}

void ScrollWidget::showEvent(QShowEvent* /*event*/) {
    bool isInTable = false;
    for (const QWidget* outer = parentWidget(); outer && !isInTable; outer = outer->parentWidget())
        isInTable = dynamic_cast<const TableWidget*>(outer) != nullptr;
    setAttribute(Qt::WA_AcceptTouchEvents, !isInTable);
}

} // namespace velmora
