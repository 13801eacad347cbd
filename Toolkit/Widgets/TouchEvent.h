// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

class QEvent;
class QTouchEvent;

namespace velmora {

/// The event as one of fingers; null for any other.
[[nodiscard]] QTouchEvent* touchEvent(QEvent* event);

} // namespace velmora
