// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Scrolling/PageWidget.h"

#include "Toolkit/Widgets/Scrolling/TouchScroll.h"
#include "Toolkit/Widgets/TouchEvent.h"

#include <QApplication>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QScrollBar>
#include <QScrollEvent>
#include <QScrollPrepareEvent>
#include <QTouchEvent>

#include <algorithm>
#include <cmath>
#include <utility>

namespace velmora {

PageWidget::PageWidget() {
    setObjectName("velmora.page");
    setFrameShape(QFrame::NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setFocusPolicy(Qt::NoFocus);
    setWidget(new QWidget);
    widget()->setBackgroundRole(QPalette::Window);
    viewport()->setAttribute(Qt::WA_AcceptTouchEvents);
}

void PageWidget::setContentHeight(int height) {
    _contentHeight = height;
    layoutPage();
}

void PageWidget::layoutPage() {
    widget()->resize(viewport()->width(), std::max(_contentHeight, viewport()->height()));
}

bool PageWidget::viewportEvent(QEvent* event) {
    if (const QTouchEvent* const fingers = touchEvent(event)) {
        touch(*fingers);
        event->accept();
        return true;
    }
    switch (event->type()) {
    case QEvent::ScrollPrepare: {
        auto* const prepare = static_cast<QScrollPrepareEvent*>(event);
        prepare->setViewportSize(viewport()->size());
        prepare->setContentPosRange({0, 0, 0, static_cast<double>(verticalScrollBar()->maximum())});
        prepare->setContentPos({0, static_cast<double>(verticalScrollBar()->value())});
        prepare->accept();
        return true;
    }
    case QEvent::Scroll:
        _isTap = false;
        verticalScrollBar()->setValue(
            static_cast<int>(std::round(static_cast<QScrollEvent*>(event)->contentPos().y())));
        return true;
    default: return QScrollArea::viewportEvent(event);
    }
}

void PageWidget::touch(const QTouchEvent& event) {
    const bool isScroll = scrollByTouch(*viewport(), event);
    if (event.type() == QEvent::TouchBegin)
        _isTap = !isScroll;
    if (event.type() != QEvent::TouchEnd || !std::exchange(_isTap, false) || event.points().isEmpty())
        return;
    tap(viewport()->mapFromGlobal(event.points().first().globalPosition()).toPoint());
}

/// The page has taken the touch, so that no click comes of it by itself.
void PageWidget::tap(const QPoint& place) {
    QWidget* const target = viewport()->childAt(place);
    if (!target)
        return;
    const QPointF inside = target->mapFrom(viewport(), place);
    const QPointF global = target->mapToGlobal(inside);
    const QPointer<QWidget> alive(target);
    for (const QEvent::Type type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease}) {
        QMouseEvent click(type, inside, global, Qt::LeftButton,
                          type == QEvent::MouseButtonPress ? Qt::LeftButton : Qt::NoButton, Qt::NoModifier);
        if (alive)
            QApplication::sendEvent(target, &click);
    }
}

void PageWidget::resizeEvent(QResizeEvent* event) {
    QScrollArea::resizeEvent(event);
    layoutPage();
}

void PageWidget::keyPressEvent(QKeyEvent* event) {
    event->ignore(); // keys are those of what lies on the page, and of the window
}

} // namespace velmora
