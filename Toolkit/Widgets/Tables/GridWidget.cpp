// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/GridWidget.h"

#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Tables/GridCellPainter.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QPainter>

#include <algorithm>
#include <cmath>

namespace velmora {

GridWidget::GridWidget() {
    setObjectName("velmora.grid");
    setModel(&_content);
    setItemDelegate(new GridCellPainter(this));
    setFont(toQt(Font::systemFontOfSize(14)));
    setFrameShape(QFrame::NoFrame);
    setShowGrid(false);
    setWordWrap(false);
    setTabKeyNavigation(false);
    setSelectionBehavior(SelectRows);
    setSelectionMode(SingleSelection);
    setEditTriggers(NoEditTriggers);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    verticalHeader()->hide();
    verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    verticalHeader()->setMinimumSectionSize(20);
    horizontalHeader()->setSectionResizeMode(QHeaderView::Fixed);
    horizontalHeader()->setMinimumSectionSize(20);
    horizontalHeader()->setHighlightSections(false);
    horizontalHeader()->setFont(toQt(Font::systemFontOfSize(12)));
    layoutRows();
    connect(this, &QTableView::clicked, this, [this](const QModelIndex& index) { choose(index); });
}

void GridWidget::setPlaceholder(std::string_view text) {
    _placeholder = toQt(text);
    setAccessibleDescription(_placeholder);
    viewport()->update();
}

int GridWidget::rowHeight() const {
    const int text = static_cast<int>(std::ceil(fontMetrics().height()));
    return onChoose ? std::max(44, text + 20) : text + 16;
}

int GridWidget::headHeight() const {
    return horizontalHeader()->sizeHint().height();
}

void GridWidget::layoutRows() {
    verticalHeader()->setDefaultSectionSize(rowHeight());
}

void GridWidget::layoutColumns() {
    const std::vector<GridColumn>& columns = _content.columns();
    const int room = viewport()->width();
    std::vector<int> widths;
    int wanted = 0;
    int open = 0;
    for (const GridColumn& each : columns) {
        const int text = std::max(fontMetrics().horizontalAdvance(toQt(each.widest)),
                                  horizontalHeader()->fontMetrics().horizontalAdvance(toQt(each.title)) + 4);
        widths.push_back(text + 2 * GridCellPainter::margin);
        wanted += widths.back();
        open += each.widest.empty() ? 1 : 0;
    }
    for (std::size_t i = 0; i < columns.size(); ++i) {
        int width = widths[i];
        if (wanted > room)
            width = wanted > 0 ? width * room / wanted : 0;
        else if (columns[i].widest.empty())
            width += (room - wanted) / std::max(open, 1);
        else if (open == 0)
            width += (room - wanted) / static_cast<int>(columns.size());
        setColumnWidth(static_cast<int>(i), width);
    }
}

void GridWidget::choose(const QModelIndex& index) {
    const std::function<void(std::size_t)> chosen = onChoose; // the call may set another one
    if (chosen && index.isValid())
        chosen(static_cast<std::size_t>(index.row()));
}

void GridWidget::moveTo(int row) {
    if (row >= 0 && row < _content.rowCount())
        setCurrentIndex(_content.index(row, std::max(currentIndex().column(), 0)));
}

void GridWidget::paintEvent(QPaintEvent* event) {
    QTableView::paintEvent(event);
    if (_content.rowCount() > 0 || _placeholder.isEmpty())
        return;
    QPainter painter(viewport());
    painter.setPen(palette().color(QPalette::PlaceholderText));
    painter.setFont(font());
    painter.drawText(viewport()->rect().adjusted(6, 6, -6, -6),
                     static_cast<int>(Qt::AlignLeft | Qt::AlignTop) | Qt::TextWordWrap, _placeholder);
}

void GridWidget::resizeEvent(QResizeEvent* event) {
    QTableView::resizeEvent(event);
    layoutColumns();
}

void GridWidget::keyPressEvent(QKeyEvent* event) {
    switch (event->key()) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
    case Qt::Key_Space:
    case Qt::Key_Select: choose(currentIndex()); return;
    case Qt::Key_Home: moveTo(0); return;
    case Qt::Key_End: moveTo(_content.rowCount() - 1); return;
    case Qt::Key_Escape: event->ignore(); return;
    default: break;
    }
    if (event->modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier))
        event->ignore(); // a command of the window
    else
        QTableView::keyPressEvent(event);
}

void GridWidget::changeEvent(QEvent* event) {
    QTableView::changeEvent(event);
    if (event->type() == QEvent::FontChange || event->type() == QEvent::StyleChange) {
        layoutRows();
        layoutColumns();
    }
}

} // namespace velmora
