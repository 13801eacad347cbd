// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Tables/IndexPath.h"

namespace velmora {

class TableView;

/// Receives the user's selections in a table. Outlives the table's use of it.
class TableViewDelegate {
public:
    virtual ~TableViewDelegate() = default;
    /// The user tapped or clicked the row, or pressed Enter on it; it is the selected one by now. The default
    /// does nothing.
    virtual void didSelectRowAtIndexPath(TableView& tableView, const IndexPath& indexPath);
};

} // namespace velmora
