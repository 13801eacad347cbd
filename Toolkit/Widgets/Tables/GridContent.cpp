// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Widgets/Tables/GridContent.h"

#include "Toolkit/Widgets/Conversions.h"

#include <algorithm>
#include <utility>

namespace velmora {

Qt::Alignment toQt(TextAlignment alignment) {
    const Qt::Alignment horizontal = alignment == TextAlignment::left     ? Qt::AlignLeft
                                     : alignment == TextAlignment::center ? Qt::AlignHCenter
                                                                          : Qt::AlignRight;
    return horizontal | Qt::AlignVCenter;
}

void GridContent::setColumns(std::vector<GridColumn> columns) {
    beginResetModel();
    _columns = std::move(columns);
    endResetModel();
}

void GridContent::setRows(std::vector<GridRow> rows) {
    const int before = rowCount();
    const int after = static_cast<int>(rows.size());
    // Rows come and go at the end; the others change. So a view keeps its place, and draws what is different.
    if (after < before) {
        beginRemoveRows({}, after, before - 1);
        _rows.resize(rows.size());
        endRemoveRows();
    }
    for (int row = 0; row < std::min(before, after); ++row) {
        GridRow& shown = _rows[static_cast<std::size_t>(row)];
        GridRow& next = rows[static_cast<std::size_t>(row)];
        if (shown == next)
            continue;
        shown = std::move(next);
        emit dataChanged(index(row, 0), index(row, std::max(columnCount() - 1, 0)));
    }
    if (after > before) {
        beginInsertRows({}, before, after - 1);
        for (int row = before; row < after; ++row)
            _rows.push_back(std::move(rows[static_cast<std::size_t>(row)]));
        endInsertRows();
    }
}

const GridCell* GridContent::cell(const QModelIndex& index) const {
    if (!index.isValid() || static_cast<std::size_t>(index.row()) >= _rows.size())
        return nullptr;
    const GridRow& row = _rows[static_cast<std::size_t>(index.row())];
    const auto column = static_cast<std::size_t>(index.column());
    return column < row.size() ? &row[column] : nullptr;
}

int GridContent::rowCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : static_cast<int>(_rows.size());
}

int GridContent::columnCount(const QModelIndex& parent) const {
    return parent.isValid() ? 0 : static_cast<int>(_columns.size());
}

QVariant GridContent::data(const QModelIndex& index, int role) const {
    const GridCell* const shown = cell(index);
    if (!shown)
        return {};
    switch (role) {
    case Qt::DisplayRole: return escapedLine(velmora::toQt(shown->text));
    case Qt::AccessibleTextRole: return velmora::toQt(shown->spoken.empty() ? shown->text : shown->spoken);
    case Qt::TextAlignmentRole:
        return QVariant::fromValue(
            velmora::toQt(_columns[static_cast<std::size_t>(index.column())].alignment));
    default: return {};
    }
}

QVariant GridContent::headerData(int section, Qt::Orientation orientation, int role) const {
    const auto column = static_cast<std::size_t>(section);
    if (orientation != Qt::Horizontal || column >= _columns.size())
        return {};
    if (role == Qt::DisplayRole)
        return velmora::toQt(_columns[column].title);
    if (role == Qt::TextAlignmentRole)
        return QVariant::fromValue(velmora::toQt(_columns[column].alignment));
    return {};
}

Qt::ItemFlags GridContent::flags(const QModelIndex& index) const {
    return index.isValid() ? Qt::ItemIsEnabled | Qt::ItemIsSelectable : Qt::NoItemFlags;
}

} // namespace velmora
