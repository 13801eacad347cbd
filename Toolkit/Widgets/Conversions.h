// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Color.h"
#include "Toolkit/Font.h"
#include "Toolkit/Geometry.h"

#include <QFont>
#include <QPalette>
#include <QRect>
#include <QString>

#include <string>
#include <string_view>

namespace velmora {

[[nodiscard]] QString toQt(std::string_view text);
/// A text as widgets of one line show it: line feeds are blanks, and what would disturb the line is escaped.
[[nodiscard]] QString escapedLine(const QString& text);
[[nodiscard]] std::string fromQt(const QString& text);
/// Leaves the family open for the interface font, so that widgets take it from the user's setting.
[[nodiscard]] QFont toQt(const Font& font);
/// On whole points, and no narrower or lower than the rectangle.
[[nodiscard]] QRect toQt(const Rect& rect);
[[nodiscard]] Rect fromQt(const QRect& rect);
/// The colour in that palette, light or dark; that of the role for the automatic colour.
[[nodiscard]] QColor colorOf(Color color, const QPalette& palette, QPalette::ColorRole otherwise);
/// The palette's role for a colour; `otherwise` for the automatic one and for none.
[[nodiscard]] QPalette::ColorRole toQt(Color color, QPalette::ColorRole otherwise);

} // namespace velmora
