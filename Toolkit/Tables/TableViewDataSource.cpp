// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Tables/TableViewDataSource.h"

namespace velmora {

std::size_t TableViewDataSource::numberOfSections(TableView& /*tableView*/) {
    return 1;
}

TableRowSummary TableViewDataSource::summaryOfRowAtIndexPath(TableView& /*tableView*/,
                                                             const IndexPath& /*indexPath*/) {
    return {};
}

} // namespace velmora
