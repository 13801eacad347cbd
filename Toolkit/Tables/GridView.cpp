// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Tables/GridView.h"

#include "Toolkit/Widgets/Tables/GridWidget.h"

#include <utility>

namespace velmora {

GridView::GridView() : View(new GridWidget), _grid(static_cast<GridWidget*>(widget())) {}

GridView::~GridView() {
    _grid->onChoose = nullptr;
}

void GridView::setColumns(std::vector<GridColumn> columns) {
    _grid->content().setColumns(std::move(columns));
    _grid->layoutColumns();
}

void GridView::setRows(std::vector<GridRow> rows) {
    _grid->content().setRows(std::move(rows));
}

const std::vector<GridRow>& GridView::rows() const {
    return _grid->content().rows();
}

void GridView::setPlaceholder(std::string_view text) {
    _grid->setPlaceholder(text);
}

void GridView::setOnChoose(std::function<void(std::size_t)> choose) {
    _grid->onChoose = std::move(choose);
    _grid->layoutRows();
}

double GridView::heightOfRows(std::size_t rows) const {
    return _grid->headHeight() + static_cast<double>(rows) * _grid->rowHeight() + 2;
}

} // namespace velmora
