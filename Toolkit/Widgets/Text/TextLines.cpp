// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Text/TextLines.h"

#include <QFontMetricsF>
#include <QTextLayout>

#include <algorithm>

namespace velmora {

QStringList linesOfText(const QString& text, const QFont& font, double width, int maximum,
                        Qt::TextElideMode elideMode) {
    const QFontMetricsF metrics(font);
    if (metrics.horizontalAdvance(text) <= width)
        return {text};
    QStringList lines;
    qsizetype begin = 0;
    if (maximum > 1) {
        QTextLayout layout(text, font);
        QTextOption option;
        option.setWrapMode(QTextOption::WrapAtWordBoundaryOrAnywhere);
        layout.setTextOption(option);
        layout.beginLayout();
        while (lines.size() + 1 < maximum) {
            QTextLine line = layout.createLine();
            if (!line.isValid())
                break;
            line.setLineWidth(std::max(width, 1.0));
            lines << text.mid(line.textStart(), line.textLength()).trimmed();
            begin = line.textStart() + line.textLength();
        }
        layout.endLayout();
    }
    const QString rest = text.mid(begin).trimmed();
    if (!rest.isEmpty())
        lines << (metrics.horizontalAdvance(rest) <= width ? rest
                                                           : metrics.elidedText(rest, elideMode, width));
    return lines;
}

} // namespace velmora
