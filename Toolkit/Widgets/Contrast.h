// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <QColor>

namespace velmora {

/// Relative luminance of a colour in sRGB as WCAG 2 defines it, 0 (black) to 1 (white).
[[nodiscard]] double luminance(const QColor& color);

/// The contrast of two opaque colours as WCAG 2 defines it, 1 to 21.
[[nodiscard]] double contrast(const QColor& one, const QColor& other);

/// The wished colour as it looks on the ground, if marks of it can be seen there (a contrast of 3:1, the
/// least that WCAG 2 allows); else the other one.
[[nodiscard]] QColor markColor(const QColor& wished, const QColor& ground, const QColor& otherwise);

} // namespace velmora
