// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Font.h"

#include "Toolkit/Widgets/Conversions.h"

#include <QFontMetricsF>

#include <utility>

namespace velmora {

Font::Font(std::string family, double size, bool isBold)
    : _family(std::move(family)), _size(size), _isBold(isBold) {}

Font Font::systemFontOfSize(double size) {
    return {{}, size, false};
}

Font Font::boldSystemFontOfSize(double size) {
    return {{}, size, true};
}

Font Font::named(std::string family, double size) {
    return {std::move(family), size, false};
}

Size sizeOfText(std::string_view text, const Font& font) {
    const QFontMetricsF metrics(toQt(font));
    return {metrics.horizontalAdvance(escapedLine(toQt(text))), metrics.height()};
}

} // namespace velmora
