// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Scrolling/TouchScroll.h"

#include <QScroller>
#include <QTouchEvent>
#include <QWidget>

namespace velmora {

bool scrollByTouch(QWidget& widget, const QTouchEvent& event) {
    // The scroller gets its input from here: a gesture recognizer, which could do it, is never freed.
    QScroller* const scroller = QScroller::scroller(&widget);
    if (event.points().isEmpty() || event.type() == QEvent::TouchCancel) {
        scroller->stop();
        return true;
    }
    const QPointF place = widget.mapFromGlobal(event.points().first().globalPosition());
    const QScroller::Input input = event.type() == QEvent::TouchBegin ? QScroller::InputPress
                                   : event.type() == QEvent::TouchEnd ? QScroller::InputRelease
                                                                      : QScroller::InputMove;
    return scroller->handleInput(input, place, static_cast<qint64>(event.timestamp()));
}

} // namespace velmora
