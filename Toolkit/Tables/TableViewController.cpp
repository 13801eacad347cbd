// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Tables/TableViewController.h"

namespace velmora {

TableView& TableViewController::tableView() {
    return static_cast<TableView&>(view());
}

void TableViewController::viewWillAppear(bool animated) {
    ViewController::viewWillAppear(animated);
    tableView().deselectRow(tableView().indexPathForSelectedRow(), animated);
}

std::unique_ptr<View> TableViewController::loadView() {
    auto table = std::make_unique<TableView>();
    table->setDataSource(this);
    table->setDelegate(this);
    return table;
}

} // namespace velmora
