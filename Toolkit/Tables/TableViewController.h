// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Navigation/ViewController.h"
#include "Toolkit/Tables/TableView.h"

namespace velmora {

/// A screen that is one table, whose data source and delegate it is.
class TableViewController : public ViewController, public TableViewDataSource, public TableViewDelegate {
public:
    /// Loads the view if need be.
    [[nodiscard]] TableView& tableView();

    /// Unselects the row that was opened from here.
    void viewWillAppear(bool animated) override;

protected:
    [[nodiscard]] std::unique_ptr<View> loadView() override;
};

} // namespace velmora
