// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Tables/GridView.h"

#include <QAbstractTableModel>

#include <vector>

namespace velmora {

/// The cells of a grid as Qt's views ask for them.
class GridContent : public QAbstractTableModel {
public:
    void setColumns(std::vector<GridColumn> columns);
    void setRows(std::vector<GridRow> rows);
    [[nodiscard]] const std::vector<GridColumn>& columns() const { return _columns; }
    [[nodiscard]] const std::vector<GridRow>& rows() const { return _rows; }
    /// Null where the row has no such cell.
    [[nodiscard]] const GridCell* cell(const QModelIndex& index) const;

    [[nodiscard]] int rowCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] int columnCount(const QModelIndex& parent = {}) const override;
    [[nodiscard]] QVariant data(const QModelIndex& index, int role) const override;
    [[nodiscard]] QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    [[nodiscard]] Qt::ItemFlags flags(const QModelIndex& index) const override;

private:
    std::vector<GridColumn> _columns;
    std::vector<GridRow> _rows;
};

[[nodiscard]] Qt::Alignment toQt(TextAlignment alignment);

} // namespace velmora
