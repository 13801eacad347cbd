// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

class QTouchEvent;
class QWidget;

namespace velmora {

/// Scrolls the widget's content by the first touch point, with kinetic scrolling after release: the widget
/// gets QScrollPrepareEvent and QScrollEvent. True when the touch scrolls or stops a scroll, so that it is no
/// tap.
bool scrollByTouch(QWidget& widget, const QTouchEvent& event);

} // namespace velmora
