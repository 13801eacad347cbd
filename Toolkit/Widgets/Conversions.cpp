// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Conversions.h"

#include "Platform/PrintableText.h"
#include "Toolkit/Widgets/Text/TabularDigits.h"

#include <algorithm>
#include <cmath>

namespace velmora {

QString toQt(std::string_view text) {
    return QString::fromUtf8(text.data(), static_cast<qsizetype>(text.size()));
}

std::string fromQt(const QString& text) {
    return text.toStdString();
}

QString escapedLine(const QString& text) {
    const bool isPlainText = std::all_of(text.begin(), text.end(), [](QChar character) {
        return character.unicode() >= 0x20 && character.unicode() < 0x7F;
    });
    return isPlainText ? text : toQt(printableLine(fromQt(text)));
}

QFont toQt(const Font& font) {
    QFont result;
    result.setResolveMask(0);
    if (!font.family().empty())
        result.setFamily(toQt(font.family()));
    // A point of the toolkit is a 96th of an inch where the user has not scaled text, one of the font's a
    // 72nd.
    result.setPointSizeF(std::max(font.size(), 1.0) * 72 / 96);
    result.setBold(font.isBold());
    useTabularDigits(result);
    return result;
}

QRect toQt(const Rect& rect) {
    const auto whole = [](double value) { return static_cast<int>(std::clamp(value, -1e6, 1e6)); };
    return {whole(std::round(rect.x)), whole(std::round(rect.y)), whole(std::ceil(std::max(rect.width, 0.0))),
            whole(std::ceil(std::max(rect.height, 0.0)))};
}

Rect fromQt(const QRect& rect) {
    return {static_cast<double>(rect.x()), static_cast<double>(rect.y()), static_cast<double>(rect.width()),
            static_cast<double>(rect.height())};
}

QPalette::ColorRole toQt(Color color, QPalette::ColorRole otherwise) {
    switch (color) {
    case Color::darkText: return QPalette::WindowText;
    case Color::secondary: return QPalette::PlaceholderText;
    case Color::ground: return QPalette::Window;
    case Color::automatic:
    case Color::clear:
    case Color::poor:
    case Color::fair:
    case Color::good:
    case Color::excellent: break;
    }
    return otherwise;
}

QColor colorOf(Color color, const QPalette& palette, QPalette::ColorRole otherwise) {
    // Each has a contrast of at least 4.5:1 to a white or a dark ground.
    const bool isDark = palette.color(QPalette::Window).lightness() < 128;
    switch (color) {
    case Color::poor: return isDark ? QColor(255, 138, 128) : QColor(179, 38, 30);
    case Color::fair: return isDark ? QColor(255, 192, 77) : QColor(138, 84, 0);
    case Color::good: return isDark ? QColor(125, 220, 139) : QColor(27, 110, 46);
    case Color::excellent: return isDark ? QColor(108, 199, 255) : QColor(0, 92, 148);
    default: return palette.color(toQt(color, otherwise));
    }
}

} // namespace velmora
