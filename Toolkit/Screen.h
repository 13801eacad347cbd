// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Geometry.h"

namespace velmora {

/// The screen as the program should use it. Needs the application.
class Screen {
public:
    /// The size of the program's window: 390 x 844 points on a desktop, limited to the desktop's size; the
    /// entire screen on a device whose windows fill it. From 0, 0.
    [[nodiscard]] static Rect mainBounds();
    /// The part of it that no bars of the system cover; the inside of the program's window once that is up.
    [[nodiscard]] static Rect mainApplicationFrame();
};

} // namespace velmora
