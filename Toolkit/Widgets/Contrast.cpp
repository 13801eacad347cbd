// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Contrast.h"

#include <algorithm>
#include <cmath>

namespace velmora {

namespace {

constexpr double leastContrast = 3;

/// A colour that lets some of the ground through, as it is seen.
QColor blended(const QColor& color, const QColor& ground) {
    const float part = color.alphaF();
    const auto mixed = [part](float above, float below) { return above * part + below * (1 - part); };
    return QColor::fromRgbF(mixed(color.redF(), ground.redF()), mixed(color.greenF(), ground.greenF()),
                            mixed(color.blueF(), ground.blueF()));
}

} // namespace

double luminance(const QColor& color) {
    const auto linear = [](double part) {
        return part <= 0.04045 ? part / 12.92 : std::pow((part + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
}

double contrast(const QColor& one, const QColor& other) {
    const double first = luminance(one);
    const double second = luminance(other);
    return (std::max(first, second) + 0.05) / (std::min(first, second) + 0.05);
}

QColor markColor(const QColor& wished, const QColor& ground, const QColor& otherwise) {
    const QColor seen = blended(wished, ground);
    return contrast(seen, ground) >= leastContrast ? seen : otherwise;
}

} // namespace velmora
