// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

class QTouchEvent;
class QWidget;

namespace velmora {

/// Has the widget's content follow the first finger of a touch, and run on when it is let go in motion: the
/// widget gets QScrollPrepareEvent and QScrollEvent. True when the finger scrolls or stops what ran on, so
/// that it means nothing else.
bool followFinger(QWidget& widget, const QTouchEvent& event);

} // namespace velmora
