// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Tables/IndexPath.h"

#include <functional>
#include <string>
#include <vector>

namespace velmora {

class TableView;

/// A command of a row's menu.
struct MenuItem {
    std::string title;
    std::function<void()> action;
};

/// Receives the user's selections in a table. Outlives the table's use of it.
class TableViewDelegate {
public:
    virtual ~TableViewDelegate() = default;
    /// The user tapped or clicked the row, or pressed Enter on it; it is the selected one by now. The default
    /// does nothing.
    virtual void didSelectRowAtIndexPath(TableView& tableView, const IndexPath& indexPath);
    /// The row's menu, which a right click, the menu key and a long press open. The default has none.
    [[nodiscard]] virtual std::vector<MenuItem> menuForRowAtIndexPath(TableView& tableView,
                                                                      const IndexPath& indexPath);
};

} // namespace velmora
