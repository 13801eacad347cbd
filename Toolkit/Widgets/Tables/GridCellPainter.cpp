// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/GridCellPainter.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Tables/GridContent.h"

#include <QPainter>

#include <algorithm>

namespace velmora {

namespace {

constexpr int barHeight = 4;

} // namespace

void GridCellPainter::paint(QPainter* painter, const QStyleOptionViewItem& option,
                            const QModelIndex& index) const {
    const auto* const content = dynamic_cast<const GridContent*>(index.model());
    const GridCell* const cell = content ? content->cell(index) : nullptr;
    if (!cell)
        return;
    const bool isSelected = option.state.testFlag(QStyle::State_Selected);
    const QPalette& palette = option.palette;
    if (isSelected)
        painter->fillRect(option.rect, palette.color(QPalette::Highlight));
    const QColor ink =
        isSelected ? palette.color(QPalette::HighlightedText) : colorOf(cell->color, palette, QPalette::Text);
    QRect room = option.rect.adjusted(margin, 0, -margin, 0);
    if (cell->bar) {
        const QRect whole(room.left(), room.bottom() - barHeight - 2, room.width(), barHeight);
        QRect filled = whole;
        filled.setWidth(static_cast<int>(whole.width() * std::clamp(*cell->bar, 0.0, 1.0)));
        QColor ground = ink;
        ground.setAlphaF(0.18F);
        painter->fillRect(whole, ground);
        painter->fillRect(filled, ink);
        room.setBottom(whole.top());
    }
    painter->setPen(ink);
    painter->setFont(option.font);
    const QString text = index.data(Qt::DisplayRole).toString();
    const Qt::Alignment alignment = index.data(Qt::TextAlignmentRole).value<Qt::Alignment>();
    painter->drawText(room, static_cast<int>(alignment) | Qt::TextSingleLine,
                      option.fontMetrics.elidedText(text, Qt::ElideRight, room.width()));
    if (option.state.testFlag(QStyle::State_HasFocus)) {
        painter->setPen(QPen(isSelected ? ink : palette.color(QPalette::Highlight), 1));
        painter->drawRect(option.rect.adjusted(0, 0, -1, -1));
    }
}

} // namespace velmora
