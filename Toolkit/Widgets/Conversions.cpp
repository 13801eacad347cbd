// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Conversions.h"

#include "Platform/PrintableText.h"
#include "Toolkit/Widgets/TabularDigits.h"

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
    case Color::clear: break;
    }
    return otherwise;
}

} // namespace velmora
