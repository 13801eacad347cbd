// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Charts/ChartTableWidget.h"

#include "Toolkit/Widgets/Conversions.h"

#include <QHeaderView>
#include <QKeyEvent>
#include <QSignalBlocker>

#include <algorithm>

namespace velmora {

ChartTableWidget::ChartTableWidget(QWidget* parent) : QTableWidget(parent) {
    setObjectName("velmora.chartTable");
    setEditTriggers(QAbstractItemView::NoEditTriggers);
    setSelectionBehavior(QAbstractItemView::SelectRows);
    setSelectionMode(QAbstractItemView::SingleSelection);
    setTabKeyNavigation(false);
    verticalHeader()->hide();
    connect(this, &QTableWidget::currentCellChanged, this, [this](int row) {
        if (row >= 0 && static_cast<std::size_t>(row) < _times_ns.size())
            _chosen_ns = _times_ns[static_cast<std::size_t>(row)];
    });
    connect(this, &QTableWidget::cellActivated, this, [this](int row) {
        if (onChoose && row >= 0 && static_cast<std::size_t>(row) < _times_ns.size())
            onChoose(_times_ns[static_cast<std::size_t>(row)]);
    });
}

void ChartTableWidget::fill(const ChartTable& table, std::int64_t current_ns) {
    const QSignalBlocker blocker(this); // a row that moves is no choice of another
    const int column = currentColumn();
    clear();
    setRowCount(static_cast<int>(table.rows.size()));
    setColumnCount(static_cast<int>(table.columns.size()));
    QStringList titles;
    for (const std::string& title : table.columns)
        titles.push_back(toQt(title));
    setHorizontalHeaderLabels(titles);
    for (std::size_t y = 0; y < table.rows.size(); ++y)
        for (std::size_t x = 0; x < table.rows[y].size(); ++x)
            setItem(static_cast<int>(y), static_cast<int>(x), new QTableWidgetItem(toQt(table.rows[y][x])));
    resizeColumnsToContents();
    _times_ns = table.times_ns;
    if (_times_ns.empty())
        return;
    const auto after = std::upper_bound(_times_ns.begin(), _times_ns.end(), _chosen_ns.value_or(current_ns));
    setCurrentCell(static_cast<int>(std::max<std::ptrdiff_t>(after - _times_ns.begin(), 1)) - 1,
                   std::max(column, 0));
}

void ChartTableWidget::keyPressEvent(QKeyEvent* event) {
    const bool closes = event->key() == Qt::Key_T || event->key() == Qt::Key_Escape;
    if (closes && onClose)
        onClose();
    else
        QTableWidget::keyPressEvent(event);
}

} // namespace velmora
