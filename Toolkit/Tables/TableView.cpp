// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Tables/TableView.h"

#include "Toolkit/Tables/TableCell.h"
#include "Toolkit/Widgets/Conversions.h"
#include "Toolkit/Widgets/Tables/EmptyLabel.h"
#include "Toolkit/Widgets/Tables/TableWidget.h"

#include <QScrollBar>

#include <algorithm>
#include <cmath>

namespace velmora {

TableView::TableView() : TableView(new TableWidget) {}

TableView::TableView(TableWidget* widget) : View(widget), _table(widget) {
    _table->view = this;
}

TableView::~TableView() {
    _table->view = nullptr;
    _table->cells().clear();
}

void TableView::setDataSource(TableViewDataSource* dataSource) {
    _table->dataSource = dataSource;
}

void TableView::setDelegate(TableViewDelegate* delegate) {
    _table->delegate = delegate;
}

void TableView::setEmptyText(std::string_view text) {
    _table->emptyLabel().setText(toQt(text));
    _table->showEmptyLabel();
}

void TableView::reloadData() {
    _table->reload();
}

std::shared_ptr<TableCell> TableView::dequeueReusableCell(std::string_view identifier) {
    return _table->cells().dequeue(identifier);
}

std::size_t TableView::numberOfSections() const {
    return _table->rows().sections();
}

std::size_t TableView::numberOfRowsInSection(std::size_t section) const {
    return _table->rows().rows(section);
}

std::shared_ptr<TableCell> TableView::cellForRow(const IndexPath& indexPath) const {
    const auto row = _table->rows().row(indexPath);
    const auto found = row ? _table->cells().all().find(*row) : _table->cells().all().end();
    return found == _table->cells().all().end() ? nullptr : found->second;
}

std::vector<IndexPath> TableView::indexPathsForVisibleRows() const {
    std::vector<IndexPath> paths;
    for (const auto& [row, cell] : _table->cells().all())
        paths.push_back(_table->rows().path(row));
    return paths;
}

double TableView::rowHeight() const {
    return _table->rowHeight();
}

Rect TableView::rectForRow(const IndexPath& indexPath) const {
    const auto row = _table->rows().row(indexPath);
    return row ? fromQt(_table->rowRect(*row)) : Rect{};
}

IndexPath TableView::indexPathForSelectedRow() const {
    return _table->rows().path(_table->selectedRow());
}

void TableView::selectRow(const IndexPath& indexPath, bool /*animated*/) {
    _table->setSelectedRow(_table->rows().row(indexPath));
}

void TableView::deselectRow(const IndexPath& indexPath, bool /*animated*/) {
    if (!indexPath.isNull() && indexPath == indexPathForSelectedRow())
        _table->setSelectedRow(std::nullopt);
}

IndexPath TableView::indexPathForFocusRow() const {
    return _table->rows().path(_table->focusRow());
}

void TableView::setFocusRow(const IndexPath& indexPath) {
    _table->setFocusRow(_table->rows().row(indexPath));
}

double TableView::contentOffset() const {
    return _table->verticalScrollBar()->value();
}

void TableView::setContentOffset(double y) {
    _table->verticalScrollBar()->setValue(static_cast<int>(std::round(std::clamp(y, 0.0, 1e9))));
}

void TableView::scrollToRow(const IndexPath& indexPath) {
    if (const auto row = _table->rows().row(indexPath))
        _table->scrollToRow(*row);
}

void TableView::sizeToFit() {
    _table->loadIfNeeded();
    const std::size_t least = _table->emptyLabel().text().isEmpty() ? 0 : 1;
    double height = static_cast<double>(std::max(_table->rows().total(), least)) * rowHeight();
    if (superview())
        height = std::min(height, std::max(superview()->bounds().height - frame().y, 0.0));
    setFrame({frame().x, frame().y, frame().width, height});
}

} // namespace velmora
