// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/TouchEvent.h"

#include <QTouchEvent>

namespace velmora {

QTouchEvent* touchEvent(QEvent* event) {
    switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
    case QEvent::TouchCancel: return static_cast<QTouchEvent*>(event);
    default: return nullptr;
    }
}

} // namespace velmora
